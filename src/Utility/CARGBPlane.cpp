#include "Utility/CARGBPlane.h"

#include "Utility/CGenericEx.h"
#include "Utility/Logger.h"
#include "Utility/RowScheduler.h"

#include <algorithm>
#include <cstdio>
#include <cstring>
#include <new>
#include <utility>
#include <vector>

using namespace orvela;

namespace {

constexpr char kSource[] = "Utility/CARGBPlane";
constexpr unsigned kCopyBlock = 1U << 18; // bytes; one piece of a parallel copy

// The product as the 32-bit count; sizes whose product does not fit are as good as out of memory.
std::int32_t countPixels(std::int32_t width, std::int32_t height) {
    std::int32_t count = 0;
    if (width < 0 || height < 0 || __builtin_mul_overflow(width, height, &count))
        throw COutOfMemoryEx(QStringLiteral("Unable to allocate Planes Memory (Direct error)."), kSource,
                             __LINE__);
    return count;
}

// To be called while the cause is being handled.
[[noreturn]] void failCreation(int line) {
    std::throw_with_nested(CGenericEx(QStringLiteral("Unable to complete plane creation."), kSource, line));
}

} // namespace

CARGBPlane::CARGBPlane(std::int32_t width, std::int32_t height, const QString& name) : mName(name) {
    Log::log(LogLevel::Debug, "CARGBPlane ctor ptr=0x%x source=%s", logAddress(this), qUtf8Printable(name));
    try {
        resize(width, height);
    } catch (...) {
        failCreation(__LINE__);
    }
}

CARGBPlane::CARGBPlane(const CARGBPlane& source, const QString& name) : mName(name) {
    Log::log(LogLevel::Debug, "CARGBPlane ctor ptr=0x%x inplane=0x%x  source=%s", logAddress(this),
             logAddress(&source), qUtf8Printable(name));
    try {
        copyFrom(source);
    } catch (...) {
        failCreation(__LINE__);
    }
}

CARGBPlane::~CARGBPlane() {
    Log::log(LogLevel::Debug, "CARGBPlane dtor ptr=0x%x", logAddress(this));
    release();
}

void CARGBPlane::copyFrom(const CARGBPlane& source) {
    if (source.mPixelCount != mPixelCount) {
        try {
            resize(source.mWidth, source.mHeight);
        } catch (...) {
            std::throw_with_nested(
                CBadPtrEx(QStringLiteral("Unable to allocate memory to copy a plane."), kSource, __LINE__));
        }
    }
    const auto count = static_cast<unsigned>(mPixelCount);
    orvela::forEachRange(0, (count + kCopyBlock - 1) / kCopyBlock, 1, [&](unsigned first, unsigned last) {
        const std::size_t offset = std::size_t{first} * kCopyBlock;
        const std::size_t size = std::min(std::size_t{last} * kCopyBlock, std::size_t{count}) - offset;
        for (const Channel channel : kChannels)
            std::memcpy(samples(channel) + offset, source.samples(channel) + offset, size);
    });
    mColorMode = source.mColorMode;
}

void CARGBPlane::swapSamples(CARGBPlane& other) {
    if (other.mWidth != mWidth || other.mHeight != mHeight)
        throw CBadPtrEx(QStringLiteral(QT_TRANSLATE_NOOP(
                            "Failure", "Only planes of the same size can exchange their samples.")),
                        kSource, __LINE__);
    mSamples.swap(other.mSamples);
    std::swap(mColorMode, other.mColorMode);
}

Row CARGBPlane::row(int y) {
    const std::size_t start = index(0, y);
    return {mSamples[0].get() + start, mSamples[1].get() + start, mSamples[2].get() + start};
}

ConstRow CARGBPlane::row(int y) const {
    const std::size_t start = index(0, y);
    return {mSamples[0].get() + start, mSamples[1].get() + start, mSamples[2].get() + start};
}

void CARGBPlane::dumpToRaw(const QByteArray& path) const {
    struct Closer {
        void operator()(std::FILE* file) const { std::fclose(file); }
    };
    const std::unique_ptr<std::FILE, Closer> file(std::fopen(path.constData(), "wb"));
    if (!file) {
        Log::log(LogLevel::Error, "Can not open file for writing in CARGBPlane::dumpToRaw");
        return;
    }
    std::vector<std::uint8_t> line(static_cast<std::size_t>(mWidth) * 3);
    for (int y = 0; y < mHeight && mAllocated; ++y) {
        const ConstRow in = row(y);
        for (std::size_t x = 0; x < static_cast<std::size_t>(mWidth); ++x) {
            for (std::size_t c = 0; c < 3; ++c)
                line[3 * x + c] = in[c][x];
        }
        std::fwrite(line.data(), 1, line.size(), file.get());
    }
}

void CARGBPlane::resize(std::int32_t width, std::int32_t height) {
    release();
    mWidth = mHeight = mPixelCount = 0; // what a failure leaves behind
    const std::int32_t count = countPixels(width, height);
    if (count != 0)
        allocate(count);
    mWidth = width;
    mHeight = height;
    mPixelCount = count;
}

void CARGBPlane::allocate(std::int32_t count) {
    try {
        for (Samples& channel : mSamples)
            channel.reset(new (std::nothrow) std::uint8_t[static_cast<std::size_t>(count)]);
        const long long bytes = 3LL * count;
        Log::log(LogLevel::Error, "CARGBPlane allocated %lld bytes (%lld MB) for this (0x%x) image.", bytes,
                 bytes / 1048576, logAddress(this));
        mAllocated = true;
    } catch (...) {
        release();
        std::throw_with_nested(COutOfMemoryEx(
            QStringLiteral("Unable to allocate Planes Memory (Direct error)."), kSource, __LINE__));
    }
    if (!mSamples[0] || !mSamples[1] || !mSamples[2]) {
        release();
        throw COutOfMemoryEx(QStringLiteral("Unable to allocate plane memory (Indirect error)."), kSource,
                             __LINE__);
    }
}

void CARGBPlane::release() {
    mAllocated = false;
    for (Samples& channel : mSamples)
        channel.reset();
}
