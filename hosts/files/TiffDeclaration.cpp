#include "files/TiffDeclaration.h"

#include "files/PixelBounds.h"
#include "files/Refusal.h"

#include <tiff.h>

#include <algorithm>
#include <array>

namespace orvela {

namespace {

constexpr std::uint64_t kMostSamples = 4; // of a pixel

// libtiff hands other samples on as they are packed, and nobody knows them.
void checkBits(const TiffPage& page, std::uint64_t samples, const std::filesystem::path& name) {
    constexpr std::array<std::uint64_t, 6> whole = {1, 2, 4, 8, 16, 32};
    const std::vector<std::uint64_t> bits = page.numbers(TIFFTAG_BITSPERSAMPLE);
    const std::uint64_t first = bits.empty() ? 1 : bits.front();
    if (std::any_of(bits.begin(), bits.end(), [&](std::uint64_t other) { return other != first; }))
        refuse(name, "has samples of different sizes", "convert it to 8 or 16 bits per channel");
    const bool known = std::find(whole.begin(), whole.end(), first) != whole.end();
    if (!known || (first < 8 && samples > 1))
        refuse(name, "has samples of " + std::to_string(first) + " bits",
               "convert it to 8 or 16 bits per channel");
}

void checkSamples(const TiffPage& page, std::uint64_t samples, const std::filesystem::path& name) {
    if (samples == 0)
        refuse(name, "is damaged: its pixels have no samples", kCopyAgain);
    if (samples > kMostSamples)
        refuse(name, "has more than four channels (" + std::to_string(samples) + ")",
               "save it flattened, without extra channels");
    checkBits(page, samples, name);
}

// The most pixels that a byte of the page can hold.
double mostPixelsPerByte(const TiffFile& tiff, const TiffPage& page, int index, std::uint64_t bitsPerPixel) {
    const auto ofBytes = [&](double bytes) { return bytes * 8 / static_cast<double>(bitsPerPixel); };
    switch (page.number(TIFFTAG_COMPRESSION, COMPRESSION_NONE)) {
    case COMPRESSION_NONE:
        return ofBytes(1);
    case COMPRESSION_PACKBITS:
        return ofBytes(64);
    case COMPRESSION_LZW:
        return ofBytes(bounds::kLzw);
    case COMPRESSION_DEFLATE:
    case COMPRESSION_ADOBE_DEFLATE:
        return ofBytes(bounds::kDeflate);
    case COMPRESSION_ZSTD:
        return ofBytes(bounds::kZstd);
    case COMPRESSION_LZMA:
        return ofBytes(bounds::kLzma);
    case COMPRESSION_CCITTRLE:
    case COMPRESSION_CCITTRLEW:
    case COMPRESSION_CCITTFAX3:
    case COMPRESSION_CCITTFAX4:
        return 8 * static_cast<double>(page.number(TIFFTAG_IMAGEWIDTH, 0)); // a row takes a bit at least
    case COMPRESSION_JPEG:
    case COMPRESSION_OJPEG:
        return bounds::kJpeg;
    case COMPRESSION_WEBP:
        return bounds::ofWebp(tiff.readBlocks(page, index, 1).front());
    default:
        return bounds::kNone;
    }
}

} // namespace

DeclaredPicture declaredPicture(const TiffFile& tiff, const TiffPage& page, int index,
                                std::uint64_t fileBytes) {
    const std::uint64_t samples = page.number(TIFFTAG_SAMPLESPERPIXEL, 1);
    checkSamples(page, samples, tiff.pageName(index));
    const bool palette = page.number(TIFFTAG_PHOTOMETRIC, PHOTOMETRIC_MINISBLACK) == PHOTOMETRIC_PALETTE;
    const std::uint64_t bits = page.number(TIFFTAG_BITSPERSAMPLE, 1);
    DeclaredPicture picture;
    picture.width = static_cast<std::int64_t>(page.number(TIFFTAG_IMAGEWIDTH, 0));
    picture.height = static_cast<std::int64_t>(page.number(TIFFTAG_IMAGELENGTH, 0));
    picture.sampleBytes = palette ? 3 : samples * (bits > 8 ? 2 : 1);
    picture.fileBytes = fileBytes;
    // Colours of YCbCr may be stored for fewer pixels than their brightness.
    const bool thinned = page.number(TIFFTAG_PHOTOMETRIC, PHOTOMETRIC_MINISBLACK) == PHOTOMETRIC_YCBCR;
    picture.mostPixelsPerByte = mostPixelsPerByte(tiff, page, index, thinned ? bits : samples * bits);
    picture.fileInView = true;
    return picture;
}

} // namespace orvela
