#include "files/PhotographReader.h"

#include "files/EncodingProbe.h"
#include "files/HeifReader.h"
#include "files/JpegReader.h"
#include "files/PsdFile.h"
#include "files/Refusal.h"
#include "files/SourceFile.h"
#include "files/Vips.h"
#include "metadata/MetadataReader.h"

#include <algorithm>
#include <cstring>
#include <limits>

namespace orvela {

namespace {

namespace fs = std::filesystem;

VipsImage* load(const Bytes& file, FileFormat format) {
    void* data = const_cast<std::uint8_t*>(file.data());
    VipsImage* image = nullptr;
    const auto run = [&](auto loader) {
        return loader(data, file.size(), &image, "access", VIPS_ACCESS_SEQUENTIAL, "fail_on",
                      VIPS_FAIL_ON_TRUNCATED, nullptr);
    };
    switch (format) {
    case FileFormat::Png:
        run(vips_pngload_buffer);
        break;
    case FileFormat::Tiff:
        run(vips_tiffload_buffer);
        break;
    case FileFormat::WebP:
        run(vips_webpload_buffer);
        break;
    case FileFormat::Jpeg: // these have readers of their own
    case FileFormat::Heif:
    case FileFormat::Psd:
        break;
    }
    return image;
}

VipsHandle open(const fs::path& path, const Bytes& file, FileFormat format) {
    startVips();
    vips_error_clear();
    if (format == FileFormat::Png && !pngIsComplete(file))
        refuse(path, "the file is cut short", kCopyAgain);
    VipsHandle image(load(file, format));
    if (!image)
        refuseUnread(path, takeVipsError());
    return image;
}

// Of the kinds it names, scRGB always has float samples, which depthOf refuses.
ColorModel modelOf(const fs::path& path, VipsImage* image) {
    const int bands = vips_image_get_bands(image);
    const VipsInterpretation kind = vips_image_get_interpretation(image);
    const bool grey = kind == VIPS_INTERPRETATION_B_W || kind == VIPS_INTERPRETATION_GREY16;
    const bool rgb = kind == VIPS_INTERPRETATION_sRGB || kind == VIPS_INTERPRETATION_RGB ||
                     kind == VIPS_INTERPRETATION_RGB16 || kind == VIPS_INTERPRETATION_scRGB;
    if (bands > 4)
        refuse(path, "has more than four channels", "save it flattened, without extra channels");
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

int numberField(VipsImage* image, const char* name) {
    int value = 0;
    if (vips_image_get_typeof(image, name) != 0)
        vips_image_get_int(image, name, &value);
    return value;
}

Encoding encodingOf(const Bytes& file, FileFormat format) {
    Encoding encoding;
    encoding.format = format;
    if (format == FileFormat::Png)
        encoding.progressive = file.size() > 28 && file[28] == 1;
    if (format == FileFormat::Tiff)
        encoding.compression = probeTiffCompression(file);
    if (format == FileFormat::WebP)
        encoding.lossless = webpIsLossless(file);
    return encoding;
}

// Exif's density counts only where the container says nothing.
void takeResolution(Photograph& photograph) {
    const std::optional<Density> density = densityOf(*photograph.metadata);
    if (!density || density->millimetres() == 0)
        return;
    photograph.xResolution = density->x.value() / density->millimetres();
    photograph.yResolution = density->y.value() / density->millimetres();
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

int storeRows(VipsRegion* region, VipsRect* area, void* target) {
    auto* samples = static_cast<std::uint8_t*>(target);
    const std::size_t row = VIPS_IMAGE_SIZEOF_LINE(region->im);
    for (int y = area->top; y < area->top + area->height; ++y)
        std::memcpy(samples + static_cast<std::size_t>(y) * row, VIPS_REGION_ADDR(region, 0, y), row);
    return 0;
}

void takeSamples(Photograph& photograph, const fs::path& path, VipsImage* image) {
    photograph.samples.resize(VIPS_IMAGE_SIZEOF_IMAGE(image));
    if (vips_sink_disc(image, storeRows, photograph.samples.data()) != 0)
        refuseUnread(path, takeVipsError());
}

double mostPixelsPerByte(const Bytes& file, FileFormat format) {
    // Deflate makes at most 1032 bytes of one; the 25th byte tells the bits of a sample.
    if (format == FileFormat::Png && file.size() > 24 && file[24] > 0)
        return 1032.0 * 8 / file[24];
    return std::numeric_limits<double>::infinity();
}

Photograph decode(const Bytes& file, FileFormat format, const fs::path& path, const ReadLimits& limits) {
    const VipsHandle image = open(path, file, format);
    Photograph photograph;
    photograph.source = path;
    photograph.width = vips_image_get_width(image.get());
    photograph.height = vips_image_get_height(image.get());
    photograph.model = modelOf(path, image.get());
    photograph.depth = depthOf(path, image.get());
    const auto sampleBytes =
        static_cast<std::uint64_t>(samplesPerPixel(photograph.model) * photograph.depth / 8);
    checkPicture(
        {photograph.width, photograph.height, sampleBytes, file.size(), mostPixelsPerByte(file, format)},
        path, limits);
    photograph.encoding = encodingOf(file, format);
    photograph.pages = std::max(1, numberField(image.get(), VIPS_META_N_PAGES));
    takeProfile(photograph, image.get());
    takeSamples(photograph, path, image.get());
    return photograph;
}

Photograph read(const Bytes& file, FileFormat format, const fs::path& path, const ReadLimits& limits) {
    switch (format) {
    case FileFormat::Jpeg:
        return readJpeg(file, path, limits);
    case FileFormat::Heif:
        return readHeif(file, path, limits);
    case FileFormat::Psd:
        return readPsd(file, path, limits);
    default:
        return decode(file, format, path, limits);
    }
}

} // namespace

Photograph readPhotograph(const fs::path& path, const ReadLimits& limits) {
    const Bytes file = readWholeFile(path, UINTMAX_MAX, limits.mappedBytes);
    if (file.empty())
        refuse(path, "the file is empty", kCopyAgain);
    const std::optional<FileFormat> format = formatOfContent(file);
    if (!format)
        refuse(path, "is not a picture of a known kind",
               "JPEG, PNG, TIFF, WebP, PSD and HEIF files can be read");
    Photograph photograph = read(file, *format, path, limits);
    photograph.metadata = std::make_shared<const Metadata>(readMetadata(file, *format));
    takeResolution(photograph);
    return photograph;
}

} // namespace orvela
