#include "metadata/Metadata.h"

namespace orvela {

const char* formatName(FileFormat format) {
    switch (format) {
    case FileFormat::Jpeg:
        return "JPEG";
    case FileFormat::Png:
        return "PNG";
    case FileFormat::Tiff:
        return "TIFF";
    case FileFormat::WebP:
        return "WebP";
    case FileFormat::Psd:
        return "PSD";
    case FileFormat::Heif:
        return "HEIF";
    }
    return "";
}

bool ColorCodes::isPlain() const {
    constexpr std::uint16_t rec709 = 1;
    constexpr std::uint16_t unspecified = 2;
    constexpr std::uint16_t rec601 = 6;
    constexpr std::uint16_t srgb = 13;
    const bool primary = primaries == rec709 || primaries == unspecified;
    return primary &&
           (transfer == rec709 || transfer == unspecified || transfer == rec601 || transfer == srgb);
}

} // namespace orvela
