#include "files/TiffStorage.h"

#include "files/LibTiff.h"
#include "files/PhotographWriter.h"

#include <tiff.h>

#include <algorithm>
#include <array>
#include <string_view>

namespace orvela {

namespace {

constexpr int kDefaultQuality = 92;
constexpr int kFullChromaFrom = 90; // JPEG quality from which colour is kept at full resolution

struct Compression {
    std::string_view name;
    std::uint16_t code;
    bool predicts;
};

// The first of a name is the one that is written for it.
constexpr std::array kCompressions = {
    Compression{"lzw", COMPRESSION_LZW, true},
    Compression{"none", COMPRESSION_NONE, false},
    Compression{"deflate", COMPRESSION_ADOBE_DEFLATE, true},
    Compression{"deflate", COMPRESSION_DEFLATE, true},
    Compression{"packbits", COMPRESSION_PACKBITS, false},
    Compression{"zstd", COMPRESSION_ZSTD, true},
    Compression{"jpeg", COMPRESSION_JPEG, false},
};

// Null for those that this program does not write.
const Compression* compressionOf(std::uint64_t code) {
    const auto found = std::find_if(kCompressions.begin(), kCompressions.end(),
                                    [code](const Compression& c) { return c.code == code; });
    return found == kCompressions.end() ? nullptr : &*found;
}

const Compression* compressionOf(const TiffPage* page) {
    return page == nullptr ? nullptr : compressionOf(page->number(TIFFTAG_COMPRESSION, COMPRESSION_NONE));
}

bool takesJpeg(const Photograph& photograph) {
    return photograph.depth == 8 && photograph.model != ColorModel::GreyAlpha &&
           photograph.model != ColorModel::RgbAlpha;
}

const Compression& choose(const Photograph& photograph, const TiffPage* page, const WriteOptions& options) {
    if (options.compression.empty()) {
        const Compression* own = compressionOf(page);
        const bool fits = own != nullptr && (own->code != COMPRESSION_JPEG || takesJpeg(photograph));
        return fits ? *own : kCompressions.front();
    }
    const auto found = std::find_if(kCompressions.begin(), kCompressions.end(),
                                    [&](const Compression& c) { return c.name == options.compression; });
    if (found == kCompressions.end())
        throw TiffError("there is no compression \"" + options.compression + "\"");
    if (found->code == COMPRESSION_JPEG && !takesJpeg(photograph))
        throw TiffError("JPEG compression takes 8-bit pictures without transparency only");
    return *found;
}

void setJpeg(TiffStorage& storage, const Photograph& photograph, const TiffPage* page,
             const WriteOptions& options) {
    const bool likeSource = page != nullptr && page->number(TIFFTAG_COMPRESSION, 1) == COMPRESSION_JPEG;
    storage.quality = options.quality > 0                             ? options.quality
                      : likeSource && photograph.encoding.quality > 0 ? photograph.encoding.quality
                                                                      : kDefaultQuality;
    if (photograph.model != ColorModel::Rgb || storage.separate) // whose planes are not turned into YCbCr
        return;
    if (likeSource && page->number(TIFFTAG_PHOTOMETRIC, PHOTOMETRIC_YCBCR) == PHOTOMETRIC_RGB)
        return;
    storage.photometric = PHOTOMETRIC_YCBCR;
    const std::uint16_t coarse = options.chromaSubsampled.value_or(storage.quality < kFullChromaFrom) ? 2 : 1;
    storage.chroma = {coarse, coarse};
    if (likeSource && !options.chromaSubsampled) {
        const std::vector<std::uint64_t> own = page->numbers(TIFFTAG_YCBCRSUBSAMPLING);
        storage.chroma = {2, 2}; // what a file without the field has
        if (own.size() == 2)
            storage.chroma = {static_cast<std::uint16_t>(own[0]), static_cast<std::uint16_t>(own[1])};
    }
}

std::uint16_t photometricOf(const Photograph& photograph, const TiffPage* page) {
    switch (photograph.model) {
    case ColorModel::Grey:
    case ColorModel::GreyAlpha:
        return page != nullptr &&
                       page->number(TIFFTAG_PHOTOMETRIC, PHOTOMETRIC_MINISBLACK) == PHOTOMETRIC_MINISWHITE
                   ? PHOTOMETRIC_MINISWHITE
                   : PHOTOMETRIC_MINISBLACK;
    case ColorModel::Cmyk:
        return PHOTOMETRIC_SEPARATED;
    default:
        return PHOTOMETRIC_RGB;
    }
}

} // namespace

const char* tiffCompressionName(std::uint64_t compression) {
    const Compression* own = compressionOf(compression);
    return own == nullptr ? kCompressions.front().name.data() : own->name.data();
}

TiffStorage tiffStorage(const Photograph& photograph, const WriteOptions& options) {
    const TiffPage* const page = photograph.tiffPage.get();
    const Compression& compression = choose(photograph, page, options);
    TiffStorage storage;
    storage.compression = compression.code;
    storage.photometric = photometricOf(photograph, page);
    storage.extraSample = photograph.extraChannel ? EXTRASAMPLE_UNSPECIFIED : EXTRASAMPLE_UNASSALPHA;
    if (compression.predicts)
        storage.predictor = PREDICTOR_HORIZONTAL;
    if (page != nullptr) {
        storage.extraSample =
            static_cast<std::uint16_t>(page->number(TIFFTAG_EXTRASAMPLES, storage.extraSample));
        storage.separate = page->number(TIFFTAG_PLANARCONFIG, PLANARCONFIG_CONTIG) == PLANARCONFIG_SEPARATE;
        storage.tileWidth = static_cast<std::uint32_t>(page->number(TIFFTAG_TILEWIDTH, 0));
        storage.tileHeight = static_cast<std::uint32_t>(page->number(TIFFTAG_TILELENGTH, 0));
        const Compression* own = compressionOf(page);
        if (storage.predictor != 0 && own != nullptr && own->predicts)
            storage.predictor = static_cast<std::uint16_t>(page->number(TIFFTAG_PREDICTOR, 0));
    }
    if (compression.code == COMPRESSION_JPEG)
        setJpeg(storage, photograph, page, options);
    return storage;
}

} // namespace orvela
