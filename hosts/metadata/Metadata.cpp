#include "metadata/Metadata.h"

#include <algorithm>

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

void nameOnce(std::vector<std::string>& names, const std::string& name) {
    if (std::find(names.begin(), names.end(), name) == names.end())
        names.push_back(name);
}

void takeOnce(Bytes& place, ByteView block, const char* name, Metadata& metadata) {
    if (place.empty())
        place = copyOf(block);
    else if (!sameBytes(place, block))
        nameOnce(metadata.unheld, name);
}

void nameRest(ByteView rest, Metadata& metadata) {
    const auto isFilling = [](std::uint8_t byte) { return byte == 0 || byte == 0xFF; };
    while (!rest.empty() && isFilling(rest.back()))
        rest = rest.first(rest.size() - 1);
    if (holdsFilm(rest))
        nameOnce(metadata.unheld, "the film behind the picture");
    else if (!rest.empty())
        nameOnce(metadata.unheld, std::to_string(rest.size()) + " bytes behind the picture");
}

// Phones write the seconds around a photograph as a film of boxes, of which the first is short.
bool holdsFilm(ByteView bytes) {
    const std::string_view text = asText(bytes);
    for (std::size_t at = text.find("ftyp"); at != std::string_view::npos; at = text.find("ftyp", at + 1)) {
        const std::uint64_t size = at < 4 ? 0 : number(bytes, at - 4, 4, ByteOrder::Big);
        if (size >= 16 && size <= 256)
            return true;
    }
    return false;
}

} // namespace orvela
