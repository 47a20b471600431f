#include "files/TiffReader.h"

#include "files/JpegQuality.h"
#include "files/Refusal.h"
#include "files/TiffDeclaration.h"
#include "files/TiffDecoder.h"
#include "files/TiffStorage.h"
#include "metadata/MetadataReader.h"

#include <tiff.h>

namespace orvela {

namespace {

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

Photograph decodeWithVips(const TiffFile& tiff, const TiffPage& page, int index) {
    TiffPageStream alone = tiff.alone(index);
    Photograph photograph = decodeTiff(alone, tiff.pageName(index));
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
    checkPicture(declaredPicture(tiff, *page, index, file.size()), tiff.pageName(index), limits);
    Photograph photograph = TiffFile::isMask(*page) ? decodeMask(tiff, *page, index)
                            : isPlainYcbcr(*page)   ? decodeYcbcr(tiff, *page, index)
                                                    : decodeWithVips(tiff, *page, index);
    const std::uint64_t compression = page->number(TIFFTAG_COMPRESSION, COMPRESSION_NONE);
    photograph.encoding.compression = tiffCompressionName(compression);
    if (compression == COMPRESSION_JPEG)
        photograph.encoding.quality = qualityOf(tiff, *page, index);
    if (!photograph.copied)
        photograph.metadata = std::make_shared<const Metadata>(file.look(
            [&](ByteView bytes) { return readMetadata(bytes, FileFormat::Tiff, tiff.place(index)); }));
    photograph.tiffPage = page;
    return photograph;
}

} // namespace orvela
