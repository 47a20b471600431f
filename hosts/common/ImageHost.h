#pragma once

#include "Platform/FilterRecord.h"
#include "common/PictureShape.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <span>
#include <vector>

namespace orvela {

/// A 16-bit file sample (0 to 65535) in the host's range (0 to 32768); full scale maps to full scale.
constexpr std::uint16_t toHostSample(std::uint16_t file) {
    return static_cast<std::uint16_t>((file * 32768U + 32767U) / 65535U);
}

/// The way back; larger host samples count as 32768. There and back again is off by at most one.
constexpr std::uint16_t toFileSample(std::uint16_t host) {
    return static_cast<std::uint16_t>((std::min<std::uint32_t>(host, 32768U) * 65535U + 16384U) / 32768U);
}

/// The host side of the filter record over a picture in memory. Requests read the picture as it came; what
/// the filter writes goes to a second one, which starts as a copy, so that samples and channels that are
/// never written stay exactly as they are. Grey is offered as one plane, also with transparency, which the
/// filter would make opaque; RGB as three; RGB with transparency and CMYK as four.
///
/// advanceState has no argument: it answers for the youngest living ImageHost of the calling thread.
/// Construct, use and destroy a host on one thread, and destroy hosts in reverse order.
class ImageHost {
public:
    /// @param source, result  the samples, as many bytes as the shape has; they outlive this object. The
    /// result
    ///                        holds what the filter has written and handed back by a further advanceState.
    ImageHost(const PictureShape& shape, std::span<const std::uint8_t> source,
              std::span<std::uint8_t> result);
    ~ImageHost();
    ImageHost(const ImageHost&) = delete;
    ImageHost& operator=(const ImageHost&) = delete;

    /// The record for all selectors but about.
    host::FilterRecord& record() { return *mRecord; }

    /// The window above which the filter's windows are to stand, in the system's own terms.
    void setWindow(void* window) { mPlatform.hostWindow = window; }

private:
    /// An area and planes of the image, both ends of the planes included.
    struct Request {
        host::Rect area{};
        int low = 0;
        int high = -1;

        bool isEmpty() const { return area.right <= area.left || area.bottom <= area.top; }
        int width() const { return area.right - area.left; }
        int planes() const { return high - low + 1; }
    };
    using Buffer = std::vector<std::uint8_t>;

    static std::int16_t advanceState();

    void fillRecord();
    std::int16_t advance();
    bool isValid(const Request& request) const;
    std::size_t stride(const Request& request) const;
    std::size_t offset(const Request& request, int row) const;
    template <typename Copy>
    void forEachLine(const Request& request, Copy copy) const;
    Buffer take(const Request& request, std::span<const std::uint8_t> from) const;
    void store();

    static thread_local ImageHost* sActive;

    ImageHost* mPrevious;
    const PictureShape mShape;
    std::span<const std::uint8_t> mSource;
    std::span<std::uint8_t> mResult;
    alignas(16) std::array<std::byte, 1024> mRecordBytes{};
    host::FilterRecord* mRecord;
    host::PlatformData mPlatform{};
    std::array<std::uint8_t, 256> mErrorString{};
    int mPlanes;
    Request mPending;
    Buffer mIn;
    Buffer mOut;
};

} // namespace orvela
