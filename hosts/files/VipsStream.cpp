#include "files/VipsStream.h"

#include <cstdio>

namespace orvela {

VipsStream::VipsStream(TiffStream& stream) : mStream(stream) {
    startVips();
    mSource = vips_source_custom_new();
    g_signal_connect(mSource, "read", G_CALLBACK(read), this);
    g_signal_connect(mSource, "seek", G_CALLBACK(seek), this);
}

VipsStream::~VipsStream() {
    g_object_unref(mSource);
}

void VipsStream::check() const {
    if (mFailure)
        std::rethrow_exception(mFailure);
}

gint64 VipsStream::read(VipsSourceCustom*, void* data, gint64 size, VipsStream* self) {
    try {
        const std::size_t got = self->mStream.read(
            self->mPosition, {static_cast<std::uint8_t*>(data), static_cast<std::size_t>(size)});
        self->mPosition += got;
        return static_cast<gint64>(got);
    } catch (...) {
        if (!self->mFailure)
            self->mFailure = std::current_exception();
        return 0; // libtiff counts below zero, too, before it clears what it did not get
    }
}

gint64 VipsStream::seek(VipsSourceCustom*, gint64 offset, int origin, VipsStream* self) {
    const std::uint64_t start = origin == SEEK_SET   ? 0
                                : origin == SEEK_CUR ? self->mPosition
                                                     : self->mStream.size();
    self->mPosition = start + static_cast<std::uint64_t>(offset);
    return static_cast<gint64>(self->mPosition);
}

} // namespace orvela
