#include "files/EncodingProbe.h"

#include <algorithm>
#include <array>
#include <cstdlib>
#include <string_view>

namespace orvela {

namespace {

// The luminance table of the JPEG standard (table K.1) in zigzag order.
constexpr std::array<int, 64> kLuminance = {
    16, 11,  12, 14, 12, 10, 16,  14,  13,  14, 18, 17,  16,  19,  24,  40,  26, 24,  22,  22, 24, 49,
    35, 37,  29, 40, 58, 51, 61,  60,  57,  51, 56, 55,  64,  72,  92,  78,  64, 68,  87,  69, 55, 56,
    80, 109, 81, 87, 95, 98, 103, 104, 103, 62, 77, 113, 121, 112, 100, 120, 92, 101, 103, 99};

using Table = std::array<int, 64>;

std::uint32_t number(ByteView bytes, bool littleEndian) {
    std::uint32_t value = 0;
    for (std::size_t i = 0; i < bytes.size(); ++i)
        value = value << 8 | bytes[littleEndian ? bytes.size() - 1 - i : i];
    return value;
}

int qualityOf(const Table& table) {
    int best = 0;
    int bestDistance = 0;
    for (int quality = 1; quality <= 100; ++quality) {
        const int scale = quality < 50 ? 5000 / quality : 200 - 2 * quality;
        int distance = 0;
        for (std::size_t i = 0; i < table.size(); ++i)
            distance += std::abs(std::clamp((kLuminance[i] * scale + 50) / 100, 1, 255) - table[i]);
        if (best == 0 || distance <= bestDistance) {
            best = quality;
            bestDistance = distance;
        }
    }
    return best;
}

// The tables of one DQT segment; number 0 serves the first component.
void readTables(ByteView segment, Encoding& encoding) {
    for (std::size_t at = 0; at < segment.size();) {
        const std::size_t bytes = segment[at] >> 4 ? 2 : 1;
        const int id = segment[at] & 15;
        ++at;
        if (segment.size() - at < 64 * bytes)
            return;
        Table table{};
        for (std::size_t i = 0; i < 64; ++i)
            table[i] = static_cast<int>(number(segment.subspan(at + i * bytes, bytes), false));
        if (id == 0)
            encoding.quality = qualityOf(table);
        at += 64 * bytes;
    }
}

// Only chroma that is coarser both ways counts as subsampled: the writer knows full and quarter resolution,
// and a picture between the two keeps what it has by full resolution.
void readFrame(ByteView segment, Encoding& encoding) {
    constexpr std::size_t first = 6;
    if (segment.size() < first + 6 || segment[5] != 3) {
        encoding.chromaSubsampled = false;
        return;
    }
    const int luma = segment[first + 1];
    const int chroma = segment[first + 4];
    encoding.chromaSubsampled = luma >> 4 >= 2 * (chroma >> 4) && (luma & 15) >= 2 * (chroma & 15);
}

bool isFrame(int marker) {
    return marker >= 0xC0 && marker <= 0xCF && marker != 0xC4 && marker != 0xC8 && marker != 0xCC;
}

// Calls visit(marker, segment) for each segment up to the first scan; returns where its data starts.
template <typename Visit>
std::size_t walkJpeg(ByteView file, Visit visit) {
    std::size_t at = 2;
    while (at + 4 <= file.size()) {
        if (file[at] != 0xFF || file[at + 1] == 0xFF) {
            ++at;
            continue;
        }
        const int marker = file[at + 1];
        const std::size_t length = number(file.subspan(at + 2, 2), false);
        if (length < 2 || at + 2 + length > file.size())
            break;
        visit(marker, file.subspan(at + 4, length - 2));
        at += 2 + length;
        if (marker == 0xDA)
            return at;
    }
    return file.size();
}

} // namespace

Encoding probeJpeg(ByteView file) {
    Encoding encoding;
    encoding.format = FileFormat::Jpeg;
    walkJpeg(file, [&](int marker, ByteView segment) {
        if (marker == 0xDB)
            readTables(segment, encoding);
        if (isFrame(marker)) {
            encoding.progressive = marker == 0xC2;
            readFrame(segment, encoding);
        }
    });
    return encoding;
}

bool jpegIsComplete(ByteView file) {
    const ByteView scan = file.subspan(walkJpeg(file, [](int, ByteView) {}));
    constexpr std::array<std::uint8_t, 2> end = {0xFF, 0xD9};
    return std::search(scan.begin(), scan.end(), end.begin(), end.end()) != scan.end();
}

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
