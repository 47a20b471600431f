#pragma once

#include <QByteArray>
#include <QString>

#include <array>
#include <cstddef>
#include <cstdint>
#include <memory>

namespace orvela {

/// The three sample arrays of a plane.
enum class Channel : int { Red = 0, Green = 1, Blue = 2 };

/// Index over the three channels, for loops.
inline constexpr std::array<Channel, 3> kChannels = {Channel::Red, Channel::Green, Channel::Blue};

/// One row of a plane: the red, green and blue samples of its pixels, left to right.
using ConstRow = std::array<const std::uint8_t*, 3>;
using Row = std::array<std::uint8_t*, 3>;

} // namespace orvela

/// An image of 8-bit red, green and blue samples in three separate row-major arrays (top row first, no
/// padding): the sample of column x, row y stands at y * width + x. There are no alpha samples. A plane has
/// no lock: while a row pass runs, rows may be written by several threads as long as each writes its own.
class CARGBPlane {
public:
    enum ColorMode : std::int32_t { ColorUnset = 0, Color = 1, Grayscale = 2 };

    /// A plane of width x height pixels with undefined samples; none when the product is 0.
    /// @param name  role of the plane, for the log only
    /// @throws CGenericEx when the memory cannot be had
    CARGBPlane(std::int32_t width, std::int32_t height, const QString& name);

    /// A copy of `source`.
    /// @throws CGenericEx when the memory cannot be had
    CARGBPlane(const CARGBPlane& source, const QString& name);

    ~CARGBPlane();
    CARGBPlane(const CARGBPlane&) = delete;
    CARGBPlane& operator=(const CARGBPlane&) = delete;

    /// Copies samples and colour mode. Takes the source's size, reallocating, only when the pixel counts
    /// differ.
    /// @throws CBadPtrEx when the memory cannot be had; the plane is empty then
    void copyFrom(const CARGBPlane& source);

    /// Exchanges samples and colour mode with another plane of the same width and height by exchanging the
    /// arrays, whatever the size; pointers into them stay valid and belong to the other plane from then on.
    /// @throws CBadPtrEx when the sizes differ
    void swapSamples(CARGBPlane& other);

    std::int32_t width() const { return mWidth; }
    std::int32_t height() const { return mHeight; }
    std::int32_t pixelCount() const { return mPixelCount; }
    const QString& name() const { return mName; }
    bool isAllocated() const { return mAllocated; }
    ColorMode colorMode() const { return mColorMode; }
    void setColorMode(ColorMode mode) { mColorMode = mode; }

    /// The sample at column x, row y, unchecked.
    std::uint32_t red(int x, int y) const { return mSamples[0][index(x, y)]; }
    std::uint32_t green(int x, int y) const { return mSamples[1][index(x, y)]; }
    std::uint32_t blue(int x, int y) const { return mSamples[2][index(x, y)]; }

    /// One whole channel; null while the plane is empty.
    std::uint8_t* samples(orvela::Channel channel) {
        return mSamples[static_cast<std::size_t>(channel)].get();
    }
    const std::uint8_t* samples(orvela::Channel channel) const {
        return mSamples[static_cast<std::size_t>(channel)].get();
    }

    /// Row y of all three channels, unchecked.
    orvela::Row row(int y);
    orvela::ConstRow row(int y) const;

    /// Writes the samples as interleaved red, green, blue bytes without a header (3 * width * height bytes);
    /// a file that cannot be opened is only logged.
    void dumpToRaw(const QByteArray& path) const;

protected:
    /// Releases any samples, takes the size and allocates.
    /// @throws COutOfMemoryEx when the memory cannot be had; the plane is empty then
    void resize(std::int32_t width, std::int32_t height);

private:
    std::size_t index(int x, int y) const {
        return static_cast<std::size_t>(y) * static_cast<std::size_t>(mWidth) + static_cast<std::size_t>(x);
    }
    void allocate(std::int32_t count);
    void release();

    using Samples = std::unique_ptr<std::uint8_t[]>;
    std::array<Samples, 3> mSamples;
    std::int32_t mWidth = 0;
    std::int32_t mHeight = 0;
    std::int32_t mPixelCount = 0;
    QString mName;
    bool mAllocated = false;
    ColorMode mColorMode = ColorUnset;
};
