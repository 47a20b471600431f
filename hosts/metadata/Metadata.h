#pragma once

#include "metadata/Bytes.h"

#include <optional>
#include <string>
#include <vector>

namespace orvela {

enum class FileFormat { Jpeg, Png, Tiff, WebP, Psd, Heif };

/// "JPEG", "PNG", ...
const char* formatName(FileFormat format);

struct Rational {
    std::uint32_t numerator = 0;
    std::uint32_t denominator = 1;

    double value() const { return denominator == 0 ? 0.0 : static_cast<double>(numerator) / denominator; }
    bool operator==(const Rational&) const = default;
};

enum class DensityUnit { None, Inch, Centimetre, Metre };

/// Pixels per unit; without a unit only the shape of a pixel.
struct Density {
    Rational x;
    Rational y;
    DensityUnit unit = DensityUnit::None;

    /// Millimetres in a unit; 0 where there is none.
    double millimetres() const {
        constexpr double lengths[] = {0, 25.4, 10, 1000};
        return lengths[static_cast<int>(unit)];
    }
    /// Whether it says anything: some writers put zeros.
    bool isMeant() const { return x.value() > 0 && y.value() > 0; }
    bool operator==(const Density&) const = default;
};

/// A keyword and its text in UTF-8.
struct Text {
    std::string keyword;
    std::string text;

    bool operator==(const Text&) const = default;
};

/// A PNG chunk or, its name made from the marker and the identifier that its data begin with, a JPEG segment.
struct Chunk {
    std::string name;
    Bytes data;
    int marker = 0; ///< 0xE0 to 0xEF for a JPEG segment

    bool operator==(const Chunk&) const = default;
};

/// Colours by the numbers of ISO/IEC 23091-2 (H.273): the cICP chunk of a PNG, the nclx box of a HEIF.
struct ColorCodes {
    std::uint16_t primaries = 1;
    std::uint16_t transfer = 13;
    std::uint16_t matrix = 0;
    bool fullRange = true;

    /// Whether they tell what every reader takes for granted: nothing, or the colours of sRGB or of video
    /// like it.
    bool isPlain() const;
    /// Whether both tell the same of RGB samples, of which there is no matrix.
    bool looksLike(const ColorCodes& other) const {
        return primaries == other.primaries && transfer == other.transfer;
    }
    bool operator==(const ColorCodes&) const = default;
};

/// What a photograph's file says beside its picture, as bytes that can go into files of other formats.
struct Metadata {
    FileFormat format = FileFormat::Png;
    Bytes exif;                     ///< the Exif block from its byte order mark on
    Bytes xmp;                      ///< the packet
    Bytes resources;                ///< Photoshop's image resources, IPTC among them: a list of "8BIM" blocks
    std::vector<Text> texts;        ///< of a PNG; a JPEG's comments by the keyword Comment
    std::optional<Density> density; ///< what the container itself says; Exif's never overrules it
    std::optional<ColorCodes> colors;
    Bytes iccProfile;                ///< of a PNG that holds it as a text; every other goes with the picture
    int heifThumbnail = 0;           ///< longer edge of the thumbnail beside a HEIF's picture; 0 without one
    std::vector<Chunk> chunks;       ///< ancillary chunks of a PNG without neutral meaning, and its texts
    std::vector<Chunk> segments;     ///< APPn segments of a JPEG without neutral meaning
    std::vector<std::string> unheld; ///< what cannot travel whatever the target: "the gain map"
    std::vector<std::string>
        damaged; ///< what could not be understood and travels as it stands: "the Exif data"
};

/// Adds a name unless it is there.
void nameOnce(std::vector<std::string>& names, const std::string& name);

/// Takes a block into its place, which has room for one only: another that is not the same is named.
void takeOnce(Bytes& place, ByteView block, const char* name, Metadata& metadata);

/// Names what stands behind the end of a file's picture, if anything but filling does.
void nameRest(ByteView rest, Metadata& metadata);

/// Whether a film begins in there.
bool holdsFilm(ByteView bytes);

} // namespace orvela
