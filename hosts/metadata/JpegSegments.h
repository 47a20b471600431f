#pragma once

#include "metadata/Bytes.h"

#include <optional>

namespace orvela {

/// A marker segment.
struct JpegSegment {
    int marker = 0; ///< 0xC0 to 0xFE
    ByteView data;  ///< behind the length
};

struct JpegSize {
    int width = 0;
    int height = 0;

    bool operator==(const JpegSize&) const = default;
};

/// The segments up to the first scan, as far as they are whole; refer to the file.
std::vector<JpegSegment> jpegSegments(ByteView file);

/// From the first scan on; empty when there is none.
ByteView jpegScans(ByteView file);

/// The segments behind that, between scans and behind the last one, as far as they are whole.
std::vector<JpegSegment> laterJpegSegments(ByteView file);

/// What stands behind the end marker.
ByteView behindJpeg(ByteView file);

/// Edges of the picture; none when the bytes are no JPEG with a frame.
std::optional<JpegSize> jpegSize(ByteView file);

/// Whether a preview of that size will be made anew; a damaged file may claim any.
constexpr bool isThumbnailSize(const JpegSize& size) {
    constexpr int largest = 2048;
    return size.width > 0 && size.width <= largest && size.height > 0 && size.height <= largest;
}

/// Whether the marker begins a frame (SOF).
constexpr bool isJpegFrame(int marker) {
    return marker >= 0xC0 && marker <= 0xCF && marker != 0xC4 && marker != 0xC8 && marker != 0xCC;
}

} // namespace orvela
