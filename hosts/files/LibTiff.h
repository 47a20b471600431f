#pragma once

#include "files/FileFormat.h"

#include <tiffio.h>

#include <exception>
#include <stdexcept>

namespace orvela {

/// libtiff's message about what it could not do.
class TiffError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

/// What libtiff reads and writes in the place of a file.
class TiffStream {
public:
    TiffStream() = default;
    virtual ~TiffStream() = default;
    TiffStream(const TiffStream&) = delete;
    TiffStream& operator=(const TiffStream&) = delete;

    /// Fills `to` from there on; returns how many bytes there were.
    virtual std::size_t read(std::uint64_t at, std::span<std::uint8_t> to) = 0;
    virtual void write(std::uint64_t at, ByteView bytes) = 0;
    virtual std::uint64_t size() const = 0;
};

/// libtiff's handle on a stream. Messages are kept, and what the stream throws waits for check().
class TiffHandle {
public:
    /// @param mode  libtiff's
    TiffHandle(TiffStream& stream, const char* mode);
    ~TiffHandle();
    TiffHandle(const TiffHandle&) = delete;
    TiffHandle& operator=(const TiffHandle&) = delete;

    TIFF* get() const { return mTiff; }

    /// To be called on what a function of libtiff returned.
    /// @throws what the stream threw, otherwise TiffError with libtiff's message where `done` is false
    void check(bool done);

    /// Sets a field of the directory. @throws as check()
    template <typename... Values>
    void set(std::uint32_t tag, Values... values) {
        check(TIFFSetField(mTiff, tag, values...) == 1);
    }

private:
    struct Calls;

    TiffStream& mStream;
    std::uint64_t mPosition = 0;
    std::exception_ptr mFailure;
    std::string mMessage; ///< the first one
    TIFF* mTiff = nullptr;
};

} // namespace orvela
