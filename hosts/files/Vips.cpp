#include "files/Vips.h"

#include <algorithm>

namespace orvela {

namespace {

void ignoreMessage(const gchar*, GLogLevelFlags, const gchar*, gpointer) {}

bool start() {
    g_log_set_handler("VIPS",
                      static_cast<GLogLevelFlags>(G_LOG_LEVEL_WARNING | G_LOG_LEVEL_INFO | G_LOG_LEVEL_DEBUG),
                      ignoreMessage, nullptr);
    if (VIPS_INIT("orvela") != 0)
        throw PhotographError("libvips cannot start: " + takeVipsError() + "; check its installation");
    vips_cache_set_max(0);
    vips_concurrency_set(1);
    return true;
}

VipsInterpretation interpretationOf(const Photograph& photograph) {
    const bool deep = photograph.depth == 16;
    switch (photograph.model) {
    case ColorModel::Grey:
    case ColorModel::GreyAlpha:
        return deep ? VIPS_INTERPRETATION_GREY16 : VIPS_INTERPRETATION_B_W;
    case ColorModel::Cmyk:
        return VIPS_INTERPRETATION_CMYK;
    default:
        return deep ? VIPS_INTERPRETATION_RGB16 : VIPS_INTERPRETATION_sRGB;
    }
}

} // namespace

void startVips() {
    static const bool started = start();
    static_cast<void>(started);
}

VipsHandle vipsImage(const Photograph& photograph) {
    const VipsHandle plain(vips_image_new_from_memory(
        photograph.samples.data(), photograph.samples.size(), photograph.width, photograph.height,
        samplesPerPixel(photograph.model), photograph.depth == 16 ? VIPS_FORMAT_USHORT : VIPS_FORMAT_UCHAR));
    VipsImage* image = nullptr;
    if (plain)
        vips_copy(plain.get(), &image, "interpretation", interpretationOf(photograph), nullptr);
    if (image == nullptr)
        throw PhotographError("the picture cannot be encoded (" + takeVipsError() + "); report this");
    const std::vector<std::uint8_t>& profile = photograph.iccProfile;
    if (!profile.empty())
        vips_image_set_blob_copy(image, VIPS_META_ICC_NAME, profile.data(), profile.size());
    return VipsHandle(image);
}

std::string takeVipsError() {
    char* text = vips_error_buffer_copy();
    std::string line(text);
    g_free(text);
    while (!line.empty() && line.back() == '\n')
        line.pop_back();
    std::replace(line.begin(), line.end(), '\n', ',');
    return line.empty() ? "unknown cause" : line;
}

} // namespace orvela
