#include "metadata/JpegSegments.h"

#include <algorithm>

namespace orvela {

namespace {

constexpr int kScan = 0xDA;
constexpr int kEnd = 0xD9;

// Calls visit(marker, data) for each segment up to the first scan; returns where that begins.
template <typename Visit>
std::size_t walk(ByteView file, Visit visit) {
    std::size_t at = 2;
    while (at + 4 <= file.size()) {
        if (file[at] != 0xFF || file[at + 1] == 0xFF || file[at + 1] == 0) {
            ++at;
            continue;
        }
        const int marker = file[at + 1];
        if (marker == kScan)
            return at;
        const std::size_t length = number(file, at + 2, 2, ByteOrder::Big);
        if (length < 2 || length > file.size() - at - 2)
            break;
        visit(marker, file.subspan(at + 4, length - 2));
        at += 2 + length;
    }
    return file.size();
}

// Within a scan: neither a stuffed byte nor filling nor a restart, which have no length.
bool hasLength(int marker) {
    return marker > 1 && marker < 0xFF && (marker < 0xD0 || marker > 0xD9);
}

// Calls visit(marker, data) for each segment behind the first scan's beginning; returns what stands behind
// the end marker.
template <typename Visit>
ByteView walkScans(ByteView file, Visit visit) {
    ByteView rest = jpegScans(file);
    while (rest.size() >= 2 && (rest[0] != 0xFF || rest[1] != kEnd)) {
        std::size_t step = 1;
        if (rest[0] == 0xFF && hasLength(rest[1]) && rest.size() >= 4) {
            step = 2 + number(rest, 2, 2, ByteOrder::Big);
            if (step >= 4 && step <= rest.size())
                visit(rest[1], rest.subspan(4, step - 4));
        }
        rest = rest.subspan(std::min(step, rest.size()));
    }
    return rest.subspan(std::min<std::size_t>(2, rest.size()));
}

} // namespace

std::vector<JpegSegment> jpegSegments(ByteView file) {
    std::vector<JpegSegment> segments;
    walk(file, [&](int marker, ByteView data) { segments.push_back({marker, data}); });
    return segments;
}

ByteView jpegScans(ByteView file) {
    return file.subspan(std::min(file.size(), walk(file, [](int, ByteView) {})));
}

std::vector<JpegSegment> laterJpegSegments(ByteView file) {
    std::vector<JpegSegment> segments;
    walkScans(file, [&](int marker, ByteView data) { segments.push_back({marker, data}); });
    return segments;
}

ByteView behindJpeg(ByteView file) {
    return walkScans(file, [](int, ByteView) {});
}

std::optional<JpegSize> jpegSize(ByteView file) {
    if (!startsWith(file, "\xFF\xD8"))
        return std::nullopt;
    for (const JpegSegment& segment : jpegSegments(file))
        if (isJpegFrame(segment.marker) && segment.data.size() >= 5) {
            const auto edge = [&](std::size_t at) {
                return static_cast<int>(number(segment.data, at, 2, ByteOrder::Big));
            };
            if (edge(1) > 0 && edge(3) > 0)
                return JpegSize{edge(3), edge(1)};
        }
    return std::nullopt;
}

} // namespace orvela
