#pragma once

#include "metadata/Metadata.h"

#include <array>
#include <cstdint>
#include <filesystem>
#include <memory>
#include <optional>
#include <stdexcept>
#include <string>
#include <vector>

namespace orvela {

/// A photograph that cannot be read or written: the text names the file, the cause and what to do.
class PhotographError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

/// The target cannot be written (permission, disk full): see PhotographError.
class TargetError : public PhotographError {
public:
    using PhotographError::PhotographError;
};

/// The memory does not suffice: see PhotographError.
class MemoryError : public PhotographError {
public:
    using PhotographError::PhotographError;
};

/// Reading or writing ended early because it was asked to stop; nothing was left behind.
class StoppedError : public PhotographError {
public:
    using PhotographError::PhotographError;
};

enum class ColorModel { Grey, GreyAlpha, Rgb, RgbAlpha, Cmyk };

/// Number of samples per pixel.
constexpr int samplesPerPixel(ColorModel model) {
    switch (model) {
    case ColorModel::Grey:
        return 1;
    case ColorModel::GreyAlpha:
        return 2;
    case ColorModel::Rgb:
        return 3;
    default:
        return 4;
    }
}

constexpr bool hasAlpha(ColorModel model) {
    return model == ColorModel::GreyAlpha || model == ColorModel::RgbAlpha;
}

/// How the components of a JPEG are stored.
struct JpegLayout {
    enum class Color { Grey, YCbCr, Rgb, Cmyk, Ycck };

    struct Component {
        int horizontal = 1;                        ///< sampling factor, 1 to 4
        int vertical = 1;                          ///< sampling factor, 1 to 4
        int table = 0;                             ///< number of its quantization table, 0 to 3
        std::array<std::uint16_t, 64> quantizer{}; ///< that table, rows from the top

        bool operator==(const Component&) const = default;
    };

    Color color = Color::YCbCr;
    bool adobeMarker = false; ///< CMYK and YCCK: whether it is marked as such
    std::vector<Component> components;
    bool arithmetic = false; ///< coded arithmetically instead of by Huffman's tables

    bool operator==(const JpegLayout&) const = default;
};

/// Resolution of colour beside that of brightness: full (4:4:4), half horizontally (4:2:2), half both ways
/// (4:2:0).
enum class Chroma { Full, HalfWidth, Half };

/// Parts of the picture of a HEIF and how many bytes a pixel took, to find a quality that takes as many.
struct HeifRate;

/// How the source was encoded, so that the result can be written alike.
struct Encoding {
    FileFormat format = FileFormat::Png;
    bool lossless = false;        ///< WebP or HEIF without loss
    bool progressive = false;     ///< interlaced or progressive
    std::string compression;      ///< by its library name: TIFF "lzw" and others, HEIF "hevc" or "av1"
    int quality = 0;              ///< TIFF with JPEG compression: 1 to 100; 0 when unknown
    int bitDepth = 0;             ///< HEIF: bits per sample in the file (8, 10 or 12); 0 when unknown
    Chroma chroma = Chroma::Full; ///< HEIF
    std::shared_ptr<const HeifRate> heifRate; ///< HEIF
    std::optional<JpegLayout> jpeg;           ///< JPEG
};

/// How a page of a TIFF is stored and what it holds beside its picture. See TiffPage.h.
struct TiffPage;

/// Notes on what reading makes of the samples.
inline constexpr char kPaletteNote[] = "its palette was resolved";
inline constexpr char kBitsNote[] = "its samples were expanded to 8 bits";
/// Name of a profile that cannot be kept.
inline constexpr char kUnsuitedProfile[] = "the ICC profile, which does not suit its colours or is damaged";

/// A photograph in memory: interleaved samples, rows from the top without padding, 8 bits or native 16 bits
/// each. CMYK samples are raw ink values, 0 without ink; where a format stores them inverted, the inversion
/// is undone on reading and done again on writing.
struct Photograph {
    int width = 0;
    int height = 0;
    int depth = 8; ///< bits per sample, 8 or 16 (0 to 65535)
    ColorModel model = ColorModel::Rgb;
    bool extraChannel = false; ///< what stands in the place of transparency is none: a saved selection, ...
    std::vector<std::uint8_t> samples;    ///< width * height * samplesPerPixel(model) * depth / 8 bytes
    std::vector<std::uint8_t> iccProfile; ///< empty when there is none
    double xResolution = 0;               ///< pixels per millimetre; 0 when the file gives none
    double yResolution = 0;               ///< pixels per millimetre; 0 when the file gives none
    int pages = 1;                        ///< of the file, which the target has to take; this is one of them
    int page = 0;                         ///< which one, counted from 0
    bool copied =
        false; ///< a page that is no picture (a transparency mask): without samples, goes as it stands
    Encoding encoding;
    std::shared_ptr<const Metadata> metadata; ///< of the file it was read from; null when it comes from none
    std::shared_ptr<const TiffPage> tiffPage; ///< null when it comes from no TIFF
    std::vector<std::string> unheld;          ///< names of what of the file is not in here: "the other pages"
    std::vector<std::string> notes;           ///< what reading made of it: "its palette was resolved"
    std::filesystem::path source;             ///< that file, for messages and so that it is never overwritten
};

} // namespace orvela
