#include "files/VipsPhotograph.h"

#include "files/Refusal.h"

namespace orvela {

namespace {

namespace fs = std::filesystem;

// Of the kinds it names, scRGB always has float samples, which depthOf refuses.
ColorModel modelOf(const fs::path& path, VipsImage* image) {
    const int bands = vips_image_get_bands(image);
    const VipsInterpretation kind = vips_image_get_interpretation(image);
    const bool grey = kind == VIPS_INTERPRETATION_B_W || kind == VIPS_INTERPRETATION_GREY16;
    const bool rgb = kind == VIPS_INTERPRETATION_sRGB || kind == VIPS_INTERPRETATION_RGB ||
                     kind == VIPS_INTERPRETATION_RGB16 || kind == VIPS_INTERPRETATION_scRGB;
    if (grey && bands <= 2)
        return bands == 1 ? ColorModel::Grey : ColorModel::GreyAlpha;
    if (rgb && bands >= 3)
        return bands == 3 ? ColorModel::Rgb : ColorModel::RgbAlpha;
    if (kind == VIPS_INTERPRETATION_CMYK && bands == 4)
        return ColorModel::Cmyk;
    const char* name = vips_enum_nick(VIPS_TYPE_INTERPRETATION, kind);
    refuse(path,
           std::string("has the colour model \"") + name + "\" with " + std::to_string(bands) + " channels",
           "convert it to RGB, grey or CMYK");
}

int depthOf(const fs::path& path, VipsImage* image) {
    const VipsBandFormat format = vips_image_get_format(image);
    if (format == VIPS_FORMAT_UCHAR && vips_image_get_coding(image) == VIPS_CODING_NONE)
        return 8;
    if (format == VIPS_FORMAT_USHORT)
        return 16;
    refuse(path,
           std::string("has samples of the kind \"") + vips_enum_nick(VIPS_TYPE_BAND_FORMAT, format) + "\"",
           "convert it to 8 or 16 bits per channel");
}

void takeProfile(Photograph& photograph, VipsImage* image) {
    const void* data = nullptr;
    std::size_t size = 0;
    if (vips_image_get_typeof(image, VIPS_META_ICC_NAME) == 0 ||
        vips_image_get_blob(image, VIPS_META_ICC_NAME, &data, &size) != 0)
        return;
    const auto* bytes = static_cast<const std::uint8_t*>(data);
    photograph.iccProfile.assign(bytes, bytes + size);
}

int appendRows(VipsRegion* region, VipsRect* area, void* target) {
    auto& samples = *static_cast<Bytes*>(target); // reserved before: nothing can be thrown
    for (int y = area->top; y < area->top + area->height; ++y) {
        const auto* row = VIPS_REGION_ADDR(region, 0, y);
        samples.insert(samples.end(), row, row + VIPS_IMAGE_SIZEOF_LINE(region->im));
    }
    return 0;
}

} // namespace

Photograph describeImage(const fs::path& path, VipsImage* image) {
    Photograph photograph;
    photograph.width = vips_image_get_width(image);
    photograph.height = vips_image_get_height(image);
    photograph.model = modelOf(path, image);
    photograph.depth = depthOf(path, image);
    takeProfile(photograph, image);
    return photograph;
}

// Rows come from the top on. Memory is taken as they come, so that a file that claims more than it has takes
// no more than it has.
void takeSamples(Photograph& photograph, const fs::path& path, VipsImage* image) {
    photograph.samples.reserve(VIPS_IMAGE_SIZEOF_IMAGE(image));
    if (vips_sink_disc(image, appendRows, &photograph.samples) != 0)
        refuseUnread(path, takeVipsError());
}

} // namespace orvela
