#include "files/LibTiff.h"

#include <array>
#include <cstdarg>
#include <cstdio>

namespace orvela {

// What libtiff calls. Exceptions must not pass through it.
struct TiffHandle::Calls {
    static TiffHandle& self(thandle_t handle) { return *static_cast<TiffHandle*>(handle); }

    template <typename Action>
    static tmsize_t guarded(TiffHandle& self, Action action) {
        try {
            const std::size_t moved = action();
            self.mPosition += moved;
            return static_cast<tmsize_t>(moved);
        } catch (...) {
            if (!self.mFailure)
                self.mFailure = std::current_exception();
            return 0; // the library counts below zero, too, before it clears what it did not get
        }
    }

    static tmsize_t read(thandle_t handle, void* data, tmsize_t size) {
        TiffHandle& it = self(handle);
        return guarded(it, [&] {
            return it.mStream.read(it.mPosition,
                                   {static_cast<std::uint8_t*>(data), static_cast<std::size_t>(size)});
        });
    }

    static tmsize_t write(thandle_t handle, void* data, tmsize_t size) {
        TiffHandle& it = self(handle);
        return guarded(it, [&] {
            it.mStream.write(it.mPosition,
                             {static_cast<const std::uint8_t*>(data), static_cast<std::size_t>(size)});
            return static_cast<std::size_t>(size);
        });
    }

    static toff_t seek(thandle_t handle, toff_t offset, int origin) {
        TiffHandle& it = self(handle);
        const std::uint64_t start = origin == SEEK_SET   ? 0
                                    : origin == SEEK_CUR ? it.mPosition
                                                         : it.mStream.size();
        return it.mPosition = start + offset;
    }

    static int close(thandle_t) { return 0; }

    static toff_t size(thandle_t handle) { return self(handle).mStream.size(); }

    static int error(TIFF*, void* user, const char*, const char* format, va_list values) {
        std::string& message = static_cast<TiffHandle*>(user)->mMessage;
        if (message.empty()) {
            std::array<char, 200> text{};
            std::vsnprintf(text.data(), text.size(), format, values);
            message = text.data();
        }
        return 1;
    }

    static int warning(TIFF*, void*, const char*, const char*, va_list) { return 1; }
};

TiffHandle::TiffHandle(TiffStream& stream, const char* mode) : mStream(stream) {
    TIFFOpenOptions* const options = TIFFOpenOptionsAlloc();
    TIFFOpenOptionsSetErrorHandlerExtR(options, Calls::error, this);
    TIFFOpenOptionsSetWarningHandlerExtR(options, Calls::warning, this);
    mTiff = TIFFClientOpenExt("TIFF", mode, this, Calls::read, Calls::write, Calls::seek, Calls::close,
                              Calls::size, nullptr, nullptr, options);
    TIFFOpenOptionsFree(options);
    check(mTiff != nullptr);
}

TiffHandle::~TiffHandle() {
    TIFFClose(mTiff);
}

void TiffHandle::check(bool done) {
    if (mFailure)
        std::rethrow_exception(mFailure);
    if (!done)
        throw TiffError(mMessage.empty() ? "unknown cause" : mMessage);
}

} // namespace orvela
