#include "files/JpegQuality.h"

#include "metadata/JpegSegments.h"

#include <algorithm>
#include <array>
#include <cstdlib>

namespace orvela {

namespace {

// The luminance table of the JPEG standard (table K.1) in zigzag order.
constexpr std::array<int, 64> kLuminance = {
    16, 11,  12, 14, 12, 10, 16,  14,  13,  14, 18, 17,  16,  19,  24,  40,  26, 24,  22,  22, 24, 49,
    35, 37,  29, 40, 58, 51, 61,  60,  57,  51, 56, 55,  64,  72,  92,  78,  64, 68,  87,  69, 55, 56,
    80, 109, 81, 87, 95, 98, 103, 104, 103, 62, 77, 113, 121, 112, 100, 120, 92, 101, 103, 99};

using Table = std::array<int, 64>;

int distance(const Table& table, int quality) {
    const int scale = quality < 50 ? 5000 / quality : 200 - 2 * quality;
    int sum = 0;
    for (std::size_t i = 0; i < table.size(); ++i)
        sum += std::abs(std::clamp((kLuminance[i] * scale + 50) / 100, 1, 255) - table[i]);
    return sum;
}

int nearestQuality(const Table& table) {
    int best = 1;
    for (int quality = 2; quality <= 100; ++quality)
        if (distance(table, quality) <= distance(table, best))
            best = quality;
    return best;
}

// Of the tables of one segment number 0, which serves the first component.
int qualityOf(ByteView tables) {
    for (std::size_t at = 0; at < tables.size();) {
        const std::size_t bytes = tables[at] >> 4 ? 2 : 1;
        const int id = tables[at] & 15;
        ++at;
        if (tables.size() - at < 64 * bytes)
            return 0;
        Table table{};
        for (std::size_t i = 0; i < 64; ++i)
            table[i] = static_cast<int>(number(tables, at + i * bytes, bytes, ByteOrder::Big));
        if (id == 0)
            return nearestQuality(table);
        at += 64 * bytes;
    }
    return 0;
}

} // namespace

int jpegQuality(ByteView file) {
    constexpr int tables = 0xDB;
    int quality = 0;
    for (const JpegSegment& segment : jpegSegments(file))
        if (segment.marker == tables && quality == 0)
            quality = qualityOf(segment.data);
    return quality;
}

} // namespace orvela
