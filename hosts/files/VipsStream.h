#pragma once

#include "files/LibTiff.h"
#include "files/Vips.h"

namespace orvela {

/// What libvips reads in the place of a file. What the stream throws waits for check().
class VipsStream {
public:
    explicit VipsStream(TiffStream& stream);
    ~VipsStream();
    VipsStream(const VipsStream&) = delete;
    VipsStream& operator=(const VipsStream&) = delete;

    VipsSource* source() { return VIPS_SOURCE(mSource); }

    /// @throws what the stream threw
    void check() const;

private:
    static gint64 read(VipsSourceCustom*, void* data, gint64 size, VipsStream* self);
    static gint64 seek(VipsSourceCustom*, gint64 offset, int origin, VipsStream* self);

    TiffStream& mStream;
    VipsSourceCustom* mSource;
    std::uint64_t mPosition = 0;
    std::exception_ptr mFailure;
};

} // namespace orvela
