#pragma once

#include "files/LibTiff.h"
#include "files/SourceFile.h"

namespace orvela {

/// A TIFF as it would be if one of its pages were the only one, so that nobody walks along the others. Its
/// samples, and all that the page leads to, stand where they stand in the file.
class TiffPageStream : public TiffStream {
public:
    /// What differs from the file, by place: the links to the page and on from it.
    struct Link {
        std::uint64_t at;
        Bytes bytes;
    };

    TiffPageStream(const SourceFile& file, std::vector<Link> links) : mFile(file), mLinks(std::move(links)) {}

    /// @throws PhotographError when the disk fails or the file became shorter
    std::size_t read(std::uint64_t at, std::span<std::uint8_t> to) override;
    void write(std::uint64_t, ByteView) override {} // never asked for by a handle for reading
    std::uint64_t size() const override { return mFile.size(); }

private:
    const SourceFile& mFile;
    const std::vector<Link> mLinks;
};

} // namespace orvela
