#include "common/ImageHost.h"

#include <cmath>
#include <cstring>
#include <limits>
#include <new>
#include <utility>

namespace orvela {

namespace {

constexpr host::Fixed kFixedOne = 0x10000;
// Behind every row, so that a filter which takes the width for the stride goes wrong at once.
constexpr int kRowPadding = 14;
constexpr std::uint8_t kPoison = 0xDB;

host::Fixed dotsPerInch(double perMillimetre) {
    const double dpi = perMillimetre > 0 ? std::min(perMillimetre * 25.4, 32767.0) : 72.0;
    return static_cast<host::Fixed>(std::lround(dpi * kFixedOne));
}

host::ImageMode modeOf(const Photograph& photograph) {
    const bool deep = photograph.depth == 16;
    switch (photograph.model) {
    case ColorModel::Grey:
    case ColorModel::GreyAlpha:
        return deep ? host::ModeGray16 : host::ModeGrayScale;
    case ColorModel::Cmyk:
        return deep ? host::ModeCMYK64 : host::ModeCMYK;
    default:
        return deep ? host::ModeRGB48 : host::ModeRGB;
    }
}

// A filter that goes on using a buffer it no longer owns shall not find its pixels there.
template <typename Buffer>
void release(Buffer& buffer) {
    std::fill(buffer.begin(), buffer.end(), kPoison);
    Buffer().swap(buffer);
}

std::uint16_t sample16(const std::uint8_t* at) {
    std::uint16_t value = 0;
    std::memcpy(&value, at, sizeof value);
    return value;
}

} // namespace

thread_local ImageHost* ImageHost::sActive = nullptr;

ImageHost::ImageHost(Photograph photograph)
    : mPrevious(sActive), mSource(std::move(photograph)), mResult(mSource),
      mRecord(new (mRecordBytes.data()) host::FilterRecord{}),
      mPlanes(mSource.model == ColorModel::GreyAlpha ? 1 : samplesPerPixel(mSource.model)) {
    fillRecord();
    sActive = this;
}

ImageHost::~ImageHost() {
    sActive = mPrevious;
}

void ImageHost::failAt(int n, std::int16_t code) {
    mFailIn = n;
    mFailCode = code;
}

void ImageHost::fillRecord() {
    host::FilterRecord& record = *mRecord;
    const auto width = static_cast<std::int16_t>(mSource.width);
    const auto height = static_cast<std::int16_t>(mSource.height);
    record.abortProc = abortProc;
    record.progressProc = progressProc;
    record.advanceState = advanceState;
    record.imageSize = {height, width};
    record.wholeSize = {height, width};
    record.filterRect = {0, 0, height, width};
    record.planes = static_cast<std::int16_t>(mPlanes);
    record.depth = mSource.depth;
    record.imageMode = modeOf(mSource);
    record.imageHRes = dotsPerInch(mSource.xResolution);
    record.imageVRes = dotsPerInch(mSource.yResolution);
    record.maxSpace = std::numeric_limits<std::int32_t>::max();
    record.bufferSpace = record.maxSpace;
    record.hostSig = 0x3842494D; // '8BIM'
    record.filterCase = 1;       // flat, no selection
    if (mSource.model == ColorModel::RgbAlpha) {
        record.filterCase = 4; // editable transparency, no selection
        record.inLayerPlanes = 3;
        record.inTransparencyMask = 1;
        record.outLayerPlanes = 3;
        record.outTransparencyMask = 1;
    }
    record.dummyPlaneValue = -1;
    record.inputPadding = -3;
    record.outputPadding = -3;
    record.maskPadding = -3;
    record.samplingSupport = 1;
    record.inputRate = kFixedOne;
    record.maskRate = kFixedOne;
    record.platformData = &mPlatform;
    record.errorString = mErrorString.data();
}

std::int16_t ImageHost::advanceState() {
    return sActive != nullptr ? sActive->advance() : static_cast<std::int16_t>(host::ParamErr);
}

host::Boolean ImageHost::abortProc() {
    return sActive != nullptr && sActive->onAbort && sActive->onAbort() ? 1 : 0;
}

void ImageHost::progressProc(std::int32_t done, std::int32_t total) {
    if (sActive != nullptr && sActive->onProgress)
        sActive->onProgress(done, total);
}

std::int16_t ImageHost::advance() {
    if (mFailIn > 0 && --mFailIn == 0)
        return mFailCode;
    host::FilterRecord& record = *mRecord;
    store();
    release(mIn);
    release(mOut);
    record.maskData = nullptr;
    record.inData = nullptr;
    record.inRowBytes = 0;
    record.outData = nullptr;
    record.outRowBytes = 0;
    const Request in{record.inRect, record.inLoPlane, record.inHiPlane};
    const Request out{record.outRect, record.outLoPlane, record.outHiPlane};
    if (!isValid(in) || !isValid(out))
        return host::ParamErr;
    try {
        mIn = take(in, mSource);
        mOut = take(out, mResult);
    } catch (const std::bad_alloc&) {
        return host::MemFullErr;
    }
    if (!in.isEmpty()) {
        record.inData = mIn.data();
        record.inRowBytes = stride(in);
    }
    if (!out.isEmpty()) {
        record.outData = mOut.data();
        record.outRowBytes = stride(out);
        mPending = out;
    }
    return host::NoErr;
}

bool ImageHost::isValid(const Request& request) const {
    if (request.isEmpty())
        return true;
    return request.area.left >= 0 && request.area.top >= 0 && request.area.right <= mSource.width &&
           request.area.bottom <= mSource.height && request.low >= 0 && request.low <= request.high &&
           request.high < mPlanes;
}

int ImageHost::stride(const Request& request) const {
    return request.width() * request.planes() * mSource.depth / 8 + kRowPadding;
}

// Calls visit(offset in the buffer, offset in the samples) for each sample of the request.
template <typename Visit>
void ImageHost::visit(const Request& request, Visit visit) const {
    const auto bytes = static_cast<std::size_t>(mSource.depth / 8);
    const auto samples = static_cast<std::size_t>(samplesPerPixel(mSource.model));
    for (int y = request.area.top; y < request.area.bottom; ++y) {
        std::size_t buffer =
            static_cast<std::size_t>(y - request.area.top) * static_cast<std::size_t>(stride(request));
        const std::size_t first = static_cast<std::size_t>(y) * static_cast<std::size_t>(mSource.width);
        for (int x = request.area.left; x < request.area.right; ++x)
            for (int plane = request.low; plane <= request.high; ++plane, buffer += bytes)
                visit(buffer,
                      ((first + static_cast<std::size_t>(x)) * samples + static_cast<std::size_t>(plane)) *
                          bytes);
    }
}

ImageHost::Buffer ImageHost::take(const Request& request, const Photograph& from) const {
    if (request.isEmpty())
        return {};
    const int rows = request.area.bottom - request.area.top;
    Buffer buffer(static_cast<std::size_t>(stride(request)) * static_cast<std::size_t>(rows), kPoison);
    if (from.depth == 8)
        visit(request, [&](std::size_t to, std::size_t at) { buffer[to] = from.samples[at]; });
    else
        visit(request, [&](std::size_t to, std::size_t at) {
            const std::uint16_t value = toHostSample(sample16(from.samples.data() + at));
            std::memcpy(buffer.data() + to, &value, sizeof value);
        });
    return buffer;
}

void ImageHost::store() {
    const Request request = std::exchange(mPending, Request{});
    if (request.isEmpty())
        return;
    if (mResult.depth == 8)
        visit(request, [&](std::size_t from, std::size_t at) { mResult.samples[at] = mOut[from]; });
    else
        visit(request, [&](std::size_t from, std::size_t at) {
            const std::uint16_t value = toFileSample(sample16(mOut.data() + from));
            std::memcpy(mResult.samples.data() + at, &value, sizeof value);
        });
}

} // namespace orvela
