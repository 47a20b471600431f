#include "files/FileFormat.h"

#include <algorithm>
#include <array>
#include <cctype>
#include <string_view>

namespace orvela {

namespace {

struct Extension {
    std::string_view text;
    FileFormat format;
};

// The first extension of a format is the one it is given where the source's own does not fit.
constexpr std::array kExtensions = {
    Extension{".jpg", FileFormat::Jpeg},  Extension{".jpeg", FileFormat::Jpeg},
    Extension{".jpe", FileFormat::Jpeg},  Extension{".png", FileFormat::Png},
    Extension{".tif", FileFormat::Tiff},  Extension{".tiff", FileFormat::Tiff},
    Extension{".webp", FileFormat::WebP}, Extension{".psd", FileFormat::Psd},
    Extension{".heic", FileFormat::Heif}, Extension{".heif", FileFormat::Heif},
    Extension{".avif", FileFormat::Heif}, Extension{".hif", FileFormat::Heif},
};

std::string extensionOf(const std::filesystem::path& path) {
    std::string text = path.extension().string();
    std::transform(text.begin(), text.end(), text.begin(),
                   [](unsigned char c) { return static_cast<char>(std::tolower(c)); });
    return text;
}

bool holds(ByteView file, std::size_t at, std::string_view text) {
    return file.size() >= at + text.size() &&
           std::equal(text.begin(), text.end(), file.begin() + static_cast<std::ptrdiff_t>(at),
                      [](char a, std::uint8_t b) { return static_cast<std::uint8_t>(a) == b; });
}

// Brands: the one that comes first, a number, and others that a reader may go by as well. What only says that
// pictures are within counts as the first.
bool isHeif(ByteView file) {
    constexpr std::array<std::string_view, 8> codings = {"heic", "heix", "heim", "heis",
                                                         "hevc", "hevx", "avif", "avis"};
    constexpr std::size_t first = 8;
    constexpr std::size_t others = 16;
    if (!holds(file, 4, "ftyp"))
        return false;
    const std::size_t end = std::min<std::size_t>(file.size(), number(file, 0, 4, ByteOrder::Big));
    const auto isCoding = [&](std::size_t at) {
        return std::any_of(codings.begin(), codings.end(),
                           [&](auto brand) { return holds(file, at, brand); });
    };
    bool found = isCoding(first) || holds(file, first, "mif1") || holds(file, first, "msf1");
    for (std::size_t at = others; at + 4 <= end && !found; at += 4)
        found = isCoding(at);
    return found;
}

std::string cannotHold(FileFormat format, const std::string& what, const char* instead) {
    return std::string(formatName(format)) + " cannot hold " + what + "; choose " + instead;
}

} // namespace

std::optional<FileFormat> formatOfContent(ByteView file) {
    using namespace std::string_view_literals;
    if (holds(file, 0, "\xFF\xD8\xFF"sv))
        return FileFormat::Jpeg;
    if (holds(file, 0, "\x89PNG\r\n\x1A\n"sv))
        return FileFormat::Png;
    if (holds(file, 0, "II*\0"sv) || holds(file, 0, "MM\0*"sv) || holds(file, 0, "II+\0"sv) ||
        holds(file, 0, "MM\0+"sv))
        return FileFormat::Tiff;
    if (holds(file, 0, "RIFF"sv) && holds(file, 8, "WEBP"sv))
        return FileFormat::WebP;
    if (holds(file, 0, "8BPS"sv))
        return FileFormat::Psd;
    if (isHeif(file))
        return FileFormat::Heif;
    return std::nullopt;
}

std::optional<FileFormat> formatOfExtension(const std::filesystem::path& path) {
    const std::string text = extensionOf(path);
    for (const Extension& extension : kExtensions)
        if (extension.text == text)
            return extension.format;
    return std::nullopt;
}

std::optional<std::string> heifCodec(const std::filesystem::path& path) {
    const std::string text = extensionOf(path);
    if (text == ".avif")
        return "av1";
    return text == ".heic" ? std::optional<std::string>("hevc") : std::nullopt;
}

std::string pixelName(ColorModel model, int depth) {
    constexpr std::array names = {"grey", "grey with transparency", "RGB", "RGB with transparency", "CMYK"};
    return std::to_string(depth) + "-bit " + names[static_cast<std::size_t>(model)];
}

std::string formatObstacle(FileFormat format, const Photograph& photograph) {
    const bool inks = photograph.model == ColorModel::Cmyk;
    switch (format) {
    case FileFormat::Jpeg:
    case FileFormat::Tiff:
        break;
    case FileFormat::Psd:
        return "PSD files can be read but not written; choose a TIFF target";
    case FileFormat::Png:
    case FileFormat::WebP:
    case FileFormat::Heif:
        if (inks)
            return cannotHold(format, pixelName(photograph.model, photograph.depth) + " pictures",
                              "a TIFF target");
        if (format == FileFormat::WebP && std::max(photograph.width, photograph.height) > 16383)
            return cannotHold(format, "edges over 16383 pixels", "a PNG or TIFF target");
        break;
    }
    return {};
}

std::filesystem::path defaultTarget(const std::filesystem::path& source, FileFormat format) {
    const FileFormat written = format == FileFormat::Psd ? FileFormat::Tiff : format;
    std::filesystem::path extension = source.extension();
    if (formatOfExtension(source) != written)
        for (const Extension& candidate : kExtensions)
            if (candidate.format == written) {
                extension = candidate.text;
                break;
            }
    std::filesystem::path name = source.stem();
    name += "-enhanced";
    name += extension;
    return source.parent_path() / name;
}

} // namespace orvela
