#include "files/TiffReader.h"

#include "files/JpegQuality.h"
#include "files/Refusal.h"
#include "files/TiffStorage.h"
#include "files/VipsPhotograph.h"
#include "metadata/MetadataReader.h"

#include <tiff.h>
#include <unistd.h>

#include <algorithm>
#include <limits>

namespace orvela {

namespace {

namespace fs = std::filesystem;

struct SourceRelease {
    void operator()(VipsSource* source) const { g_object_unref(source); }
};

VipsHandle loadPage(const SourceFile& file, int page) {
    ::lseek(file.handle(), 0, SEEK_SET); // the library begins to read where the last page was
    const std::unique_ptr<VipsSource, SourceRelease> source(vips_source_new_from_descriptor(file.handle()));
    VipsImage* image = nullptr;
    if (source)
        vips_tiffload_source(source.get(), &image, "page", page, "access", VIPS_ACCESS_SEQUENTIAL, "fail_on",
                             VIPS_FAIL_ON_TRUNCATED, nullptr);
    return VipsHandle(image);
}

// libvips takes YCbCr samples for RGB, except those of JPEG compression.
bool isPlainYcbcr(const TiffPage& page) {
    return page.number(TIFFTAG_PHOTOMETRIC, PHOTOMETRIC_MINISBLACK) == PHOTOMETRIC_YCBCR &&
           page.number(TIFFTAG_COMPRESSION, COMPRESSION_NONE) != COMPRESSION_JPEG;
}

// The tables stand before the strips or tiles, or in each of them.
int qualityOf(const TiffFile& tiff, const TiffPage& page, int index) {
    const TiffField* tables = page.find(TIFFTAG_JPEGTABLES);
    const int shared = tables == nullptr ? 0 : jpegQuality(tables->value);
    return shared > 0 ? shared : jpegQuality(tiff.readBlocks(page, index, 1).front());
}

// A code of LZW has 9 bits at least and stands for 4096 bytes at most.
double mostBytesPerByte(const TiffPage& page) {
    switch (page.number(TIFFTAG_COMPRESSION, COMPRESSION_NONE)) {
    case COMPRESSION_NONE:
        return 1;
    case COMPRESSION_PACKBITS:
        return 64;
    case COMPRESSION_LZW:
        return 4096.0 * 8 / 9;
    case COMPRESSION_DEFLATE:
    case COMPRESSION_ADOBE_DEFLATE:
        return 1032;
    default:
        return std::numeric_limits<double>::infinity();
    }
}

DeclaredPicture declared(const TiffPage& page, const SourceFile& file) {
    const bool palette = page.number(TIFFTAG_PHOTOMETRIC, PHOTOMETRIC_MINISBLACK) == PHOTOMETRIC_PALETTE;
    const std::uint64_t bits = std::max<std::uint64_t>(1, page.number(TIFFTAG_BITSPERSAMPLE, 1));
    DeclaredPicture picture;
    picture.width = static_cast<std::int64_t>(page.number(TIFFTAG_IMAGEWIDTH, 0));
    picture.height = static_cast<std::int64_t>(page.number(TIFFTAG_IMAGELENGTH, 0));
    picture.sampleBytes = palette ? 3 : page.number(TIFFTAG_SAMPLESPERPIXEL, 1) * (bits > 8 ? 2 : 1);
    picture.fileBytes = file.size();
    picture.mostPixelsPerByte = mostBytesPerByte(page) * 8 / static_cast<double>(bits);
    picture.fileInView = true;
    return picture;
}

// Size and profile, as the directory tells them.
Photograph describePage(const TiffPage& page) {
    Photograph photograph;
    photograph.width = static_cast<int>(page.number(TIFFTAG_IMAGEWIDTH, 0));
    photograph.height = static_cast<int>(page.number(TIFFTAG_IMAGELENGTH, 0));
    if (const TiffField* profile = page.find(TIFFTAG_ICCPROFILE))
        photograph.iccProfile = profile->value;
    return photograph;
}

Photograph decodeYcbcr(const TiffFile& tiff, const TiffPage& page, int index) {
    Photograph photograph = describePage(page);
    photograph.samples = tiff.readRgb(index);
    photograph.notes.emplace_back("its YCbCr samples were converted to RGB");
    return photograph;
}

Photograph decodeMask(const TiffFile& tiff, TiffPage& page, int index) {
    Photograph photograph = describePage(page);
    photograph.copied = true;
    photograph.model = ColorModel::Grey;
    page.blocks = tiff.readBlocks(page, index);
    return photograph;
}

Photograph decodeWithVips(const SourceFile& file, const TiffPage& page, const fs::path& name, int index) {
    startVips();
    vips_error_clear();
    const VipsHandle image = loadPage(file, index);
    if (!image)
        refuseUnread(name, takeVipsError());
    Photograph photograph = describeImage(name, image.get());
    takeSamples(photograph, name, image.get());
    photograph.extraChannel =
        hasAlpha(photograph.model) &&
        page.number(TIFFTAG_EXTRASAMPLES, EXTRASAMPLE_UNSPECIFIED) == EXTRASAMPLE_UNSPECIFIED;
    if (page.number(TIFFTAG_PHOTOMETRIC, PHOTOMETRIC_MINISBLACK) == PHOTOMETRIC_PALETTE)
        photograph.notes.emplace_back(kPaletteNote);
    else if (page.number(TIFFTAG_BITSPERSAMPLE, 1) < 8)
        photograph.notes.emplace_back(kBitsNote);
    return photograph;
}

} // namespace

Photograph readTiffPage(SourceFile& file, const TiffFile& tiff, int index, const ReadLimits& limits) {
    const auto page = std::make_shared<TiffPage>(tiff.page(index));
    checkPicture(declared(*page, file), tiff.pageName(index), limits);
    Photograph photograph = TiffFile::isMask(*page) ? decodeMask(tiff, *page, index)
                            : isPlainYcbcr(*page)   ? decodeYcbcr(tiff, *page, index)
                                                  : decodeWithVips(file, *page, tiff.pageName(index), index);
    const std::uint64_t compression = page->number(TIFFTAG_COMPRESSION, COMPRESSION_NONE);
    photograph.encoding.compression = tiffCompressionName(compression);
    if (compression == COMPRESSION_JPEG)
        photograph.encoding.quality = qualityOf(tiff, *page, index);
    if (!photograph.copied)
        photograph.metadata =
            std::make_shared<const Metadata>(readMetadata(file.view(), FileFormat::Tiff, tiff.place(index)));
    photograph.tiffPage = page;
    return photograph;
}

} // namespace orvela
