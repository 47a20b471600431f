#include "common/ImageHost.h"

#include <cmath>
#include <cstring>
#include <functional>
#include <limits>
#include <new>
#include <utility>

namespace orvela {

namespace {

constexpr host::Fixed kFixedOne = 0x10000;
// Behind every row, so that a filter which takes the width for the stride goes wrong at once.
constexpr int kRowPadding = 14;

host::Fixed dotsPerInch(double perMillimetre) {
    const double dpi = perMillimetre > 0 ? std::min(perMillimetre * 25.4, 32767.0) : 72.0;
    return static_cast<host::Fixed>(std::lround(dpi * kFixedOne));
}

host::ImageMode modeOf(const PictureShape& shape) {
    const bool deep = shape.depth == 16;
    switch (shape.model) {
    case ColorModel::Grey:
    case ColorModel::GreyAlpha:
        return deep ? host::ModeGray16 : host::ModeGrayScale;
    case ColorModel::Cmyk:
        return deep ? host::ModeCMYK64 : host::ModeCMYK;
    default:
        return deep ? host::ModeRGB48 : host::ModeRGB;
    }
}

template <typename Sample>
Sample load(const std::uint8_t* at) {
    Sample value{};
    std::memcpy(&value, at, sizeof value);
    return value;
}

// Copies `count` samples, of which each stands some samples behind the one before.
template <typename Sample, typename Convert>
void copySamples(std::uint8_t* to, int toStep, const std::uint8_t* from, int fromStep, int count,
                 Convert convert) {
    for (int i = 0; i < count;
         ++i, to += toStep * int{sizeof(Sample)}, from += fromStep * int{sizeof(Sample)}) {
        const Sample value = convert(load<Sample>(from));
        std::memcpy(to, &value, sizeof value);
    }
}

} // namespace

thread_local ImageHost* ImageHost::sActive = nullptr;

ImageHost::ImageHost(const PictureShape& shape, std::span<const std::uint8_t> source,
                     std::span<std::uint8_t> result)
    : mPrevious(sActive), mShape(shape), mSource(source), mResult(result),
      mRecord(new (mRecordBytes.data()) host::FilterRecord{}),
      mPlanes(shape.model == ColorModel::GreyAlpha ? 1 : samplesPerPixel(shape.model)) {
    std::copy(source.begin(), source.end(), result.begin());
    fillRecord();
    sActive = this;
}

ImageHost::~ImageHost() {
    sActive = mPrevious;
}

void ImageHost::fillRecord() {
    host::FilterRecord& record = *mRecord;
    const auto width = static_cast<std::int16_t>(mShape.width);
    const auto height = static_cast<std::int16_t>(mShape.height);
    record.abortProc = [] { return host::Boolean{0}; };
    record.progressProc = [](std::int32_t, std::int32_t) {};
    record.advanceState = advanceState;
    record.imageSize = {height, width};
    record.wholeSize = {height, width};
    record.filterRect = {0, 0, height, width};
    record.planes = static_cast<std::int16_t>(mPlanes);
    record.depth = mShape.depth;
    record.imageMode = modeOf(mShape);
    record.imageHRes = dotsPerInch(mShape.xResolution);
    record.imageVRes = dotsPerInch(mShape.yResolution);
    record.maxSpace = std::numeric_limits<std::int32_t>::max();
    record.bufferSpace = record.maxSpace;
    record.hostSig = 0x3842494D; // '8BIM'
    record.filterCase = 1;       // flat, no selection
    if (mShape.model == ColorModel::RgbAlpha) {
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

std::int16_t ImageHost::advance() {
    host::FilterRecord& record = *mRecord;
    store();
    Buffer().swap(mIn);
    Buffer().swap(mOut);
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
        record.inRowBytes = static_cast<std::int32_t>(stride(in));
    }
    if (!out.isEmpty()) {
        record.outData = mOut.data();
        record.outRowBytes = static_cast<std::int32_t>(stride(out));
        mPending = out;
    }
    return host::NoErr;
}

bool ImageHost::isValid(const Request& request) const {
    if (request.isEmpty())
        return true;
    return request.area.left >= 0 && request.area.top >= 0 && request.area.right <= mShape.width &&
           request.area.bottom <= mShape.height && request.low >= 0 && request.low <= request.high &&
           request.high < mPlanes;
}

std::size_t ImageHost::stride(const Request& request) const {
    return static_cast<std::size_t>(request.width() * request.planes() * mShape.depth / 8 + kRowPadding);
}

// Of the request's first sample in a row of the picture, which counts from the request's top.
std::size_t ImageHost::offset(const Request& request, int row) const {
    const int sample = request.area.left * samplesPerPixel(mShape.model) + request.low;
    return static_cast<std::size_t>(request.area.top + row) * mShape.bytesPerRow() +
           static_cast<std::size_t>(sample * mShape.depth / 8);
}

// Calls copy(offset in the buffer, offset in the picture) for the line of each plane in each row.
template <typename Copy>
void ImageHost::forEachLine(const Request& request, Copy copy) const {
    const auto bytes = static_cast<std::size_t>(mShape.depth / 8);
    for (int row = 0; row < request.area.bottom - request.area.top; ++row)
        for (std::size_t plane = 0; plane < static_cast<std::size_t>(request.planes()); ++plane)
            copy(stride(request) * static_cast<std::size_t>(row) + plane * bytes,
                 offset(request, row) + plane * bytes);
}

ImageHost::Buffer ImageHost::take(const Request& request, std::span<const std::uint8_t> from) const {
    if (request.isEmpty())
        return {};
    Buffer buffer(stride(request) * static_cast<std::size_t>(request.area.bottom - request.area.top));
    const int step = samplesPerPixel(mShape.model);
    forEachLine(request, [&](std::size_t to, std::size_t at) {
        if (mShape.depth == 8)
            copySamples<std::uint8_t>(&buffer[to], request.planes(), &from[at], step, request.width(),
                                      std::identity());
        else
            copySamples<std::uint16_t>(&buffer[to], request.planes(), &from[at], step, request.width(),
                                       toHostSample);
    });
    return buffer;
}

void ImageHost::store() {
    const Request request = std::exchange(mPending, Request{});
    const int step = samplesPerPixel(mShape.model);
    forEachLine(request, [&](std::size_t at, std::size_t to) {
        if (mShape.depth == 8)
            copySamples<std::uint8_t>(&mResult[to], step, &mOut[at], request.planes(), request.width(),
                                      std::identity());
        else
            copySamples<std::uint16_t>(&mResult[to], step, &mOut[at], request.planes(), request.width(),
                                       toFileSample);
    });
}

} // namespace orvela
