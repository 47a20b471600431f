#include "files/EncodingProbe.h"

#include <algorithm>
#include <string_view>

namespace orvela {

namespace {

std::uint32_t number(ByteView bytes, bool littleEndian) {
    std::uint32_t value = 0;
    for (std::size_t i = 0; i < bytes.size(); ++i)
        value = value << 8 | bytes[littleEndian ? bytes.size() - 1 - i : i];
    return value;
}

} // namespace

bool pngIsComplete(ByteView file) {
    constexpr std::string_view last = "IEND";
    for (std::size_t at = 8; at + 12 <= file.size();) {
        const std::size_t length = number(file.subspan(at, 4), false);
        if (std::equal(last.begin(), last.end(), file.begin() + static_cast<std::ptrdiff_t>(at + 4)))
            return true;
        at += 12 + length;
    }
    return false;
}

std::string probeTiffCompression(ByteView file) {
    const bool little = file.size() > 2 && file[0] == 'I';
    const auto get = [&](std::size_t at, std::size_t bytes) -> std::uint32_t {
        return at + bytes <= file.size() ? number(file.subspan(at, bytes), little) : 0;
    };
    const bool big = get(2, 2) == 43;
    // Offsets of a large TIFF are 64 bits wide; the low half serves any file that fits into memory here.
    const std::size_t directory = big ? get(little ? 8 : 12, 4) : get(4, 4);
    const std::size_t entry = big ? 20 : 12;
    const std::size_t count = big ? get(directory + (little ? 0 : 6), 2) : get(directory, 2);
    std::uint32_t code = 1;
    for (std::size_t i = 0; i < count; ++i) {
        const std::size_t at = directory + (big ? 8 : 2) + i * entry;
        if (get(at, 2) == 259)
            code = get(at + (big ? 12 : 8), 2);
    }
    switch (code) {
    case 1:
        return "none";
    case 7:
        return "jpeg";
    case 8:
    case 32946:
        return "deflate";
    case 32773:
        return "packbits";
    case 50000:
        return "zstd";
    default:
        return "lzw";
    }
}

bool webpIsLossless(ByteView file) {
    constexpr std::string_view lossless = "VP8L";
    constexpr std::string_view lossy = "VP8 ";
    const ByteView head = file.subspan(std::min<std::size_t>(12, file.size()));
    const auto at = [&](std::string_view tag) {
        return std::search(head.begin(), head.end(), tag.begin(), tag.end());
    };
    return at(lossless) < at(lossy);
}

} // namespace orvela
