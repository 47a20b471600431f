#include "files/Thumbnail.h"

#include "files/Vips.h"

#include <cmath>
#include <map>
#include <utility>

namespace orvela {

namespace {

using Pixels = std::map<std::pair<int, int>, VipsHandle>; ///< by width and height

// Runs an operation that replaces the image. @return whether it succeeded
template <typename Operation, typename... Arguments>
bool apply(VipsHandle& image, Operation operation, Arguments... arguments) {
    VipsImage* result = nullptr;
    if (!image || operation(image.get(), &result, arguments..., nullptr) != 0)
        image.reset();
    else
        image.reset(result);
    return image != nullptr;
}

// The picture reduced into the box, as 8-bit sRGB without transparency.
VipsHandle reduced(const Photograph& photograph, int width, int height) {
    VipsHandle image = vipsImage(photograph);
    if (photograph.extraChannel)
        apply(image, vips_extract_band, 0, "n", samplesPerPixel(photograph.model) - 1);
    // One that differs by the rounding of an edge fills the box.
    const double fit = std::min(static_cast<double>(width) / photograph.width,
                                static_cast<double>(height) / photograph.height);
    const bool fills =
        std::abs(width - fit * photograph.width) < 1.5 && std::abs(height - fit * photograph.height) < 1.5;
    // Without a profile the library would take the samples for another kind of sRGB.
    const char* profile = photograph.iccProfile.empty() ? nullptr : "srgb";
    apply(image, vips_thumbnail_image, width, "height", height, "size",
          fills ? VIPS_SIZE_FORCE : VIPS_SIZE_BOTH, "no_rotate", TRUE,
          profile == nullptr ? nullptr : "export_profile", profile);
    if (image && vips_image_hasalpha(image.get()))
        apply(image, vips_flatten);
    apply(image, vips_colourspace, VIPS_INTERPRETATION_sRGB);
    apply(image, vips_gravity, VIPS_COMPASS_DIRECTION_CENTRE, width, height, "extend", VIPS_EXTEND_BLACK);
    VipsHandle pixels(image ? vips_image_copy_memory(image.get()) : nullptr);
    return pixels;
}

Bytes encoded(VipsImage* pixels, int quality) {
    void* data = nullptr;
    std::size_t size = 0;
    if (vips_jpegsave_buffer(pixels, &data, &size, "Q", quality, "strip", TRUE, "optimize_coding", TRUE,
                             nullptr) != 0)
        return {};
    const auto* bytes = static_cast<const std::uint8_t*>(data);
    Bytes jpeg(bytes, bytes + size);
    g_free(data);
    return jpeg;
}

} // namespace

ThumbnailMaker thumbnailsOf(const Photograph& photograph) {
    // The same size is asked for in several qualities.
    return [&photograph, made = std::make_shared<Pixels>()](int width, int height, int quality) -> Bytes {
        startVips();
        const auto [entry, isNew] = made->try_emplace({width, height});
        if (isNew)
            entry->second = reduced(photograph, width, height);
        Bytes jpeg = entry->second ? encoded(entry->second.get(), quality) : Bytes();
        vips_error_clear();
        return jpeg;
    };
}

} // namespace orvela
