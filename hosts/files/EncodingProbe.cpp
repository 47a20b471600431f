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
