#pragma once

#include <libheif/heif.h>

#include <algorithm>
#include <bit>
#include <memory>
#include <new>
#include <stdexcept>
#include <string>

namespace orvela {

template <auto release>
struct HeifRelease {
    template <typename Object>
    void operator()(Object* object) const {
        release(object);
    }
};

template <typename Object, auto release>
using HeifPointer = std::unique_ptr<Object, HeifRelease<release>>;

using HeifContext = HeifPointer<heif_context, heif_context_free>;
using HeifHandle = HeifPointer<heif_image_handle, heif_image_handle_release>;
using HeifImage = HeifPointer<heif_image, heif_image_release>;

/// @throws std::bad_alloc, std::runtime_error with the library's text as one line when it reports an error
inline void checkHeif(const heif_error& error) {
    if (error.code == heif_error_Memory_allocation_error)
        throw std::bad_alloc();
    if (error.code == heif_error_Ok)
        return;
    std::string text = error.message;
    while (text.ends_with('\n'))
        text.pop_back();
    std::replace(text.begin(), text.end(), '\n', ' ');
    throw std::runtime_error(text);
}

/// How the library names a picture whose samples stand side by side.
inline heif_chroma interleavedChroma(bool deep, bool alpha) {
    if (deep && std::endian::native == std::endian::little)
        return alpha ? heif_chroma_interleaved_RRGGBBAA_LE : heif_chroma_interleaved_RRGGBB_LE;
    if (deep)
        return alpha ? heif_chroma_interleaved_RRGGBBAA_BE : heif_chroma_interleaved_RRGGBB_BE;
    return alpha ? heif_chroma_interleaved_RGBA : heif_chroma_interleaved_RGB;
}

} // namespace orvela
