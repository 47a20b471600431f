#include "PluginEntry/Exchange/CARGBPlanePhotoshop.h"

#include "Utility/CGenericEx.h"
#include "Utility/Logger.h"

#include <algorithm>
#include <vector>

using namespace orvela;

namespace {

constexpr char kSource[] = "CARGBPlanePhotoshop";
constexpr float kFrom16 = 255.0F / 32768.0F; // 0.007781982421875
constexpr float kTo16 = 0x1.010102p+7F;      // 128.50197, so that 255 becomes 32768

void advance(host::FilterRecord* record, std::int16_t* result, const char* failure, int line) {
    *result = record->advanceState();
    if (*result != 0)
        throw CGenericEx(QString::fromLatin1(failure), kSource, line);
}

void requestPlane(host::FilterRecord* record, int channel) {
    const auto plane = static_cast<std::int16_t>(channel);
    record->inLoPlane = plane;
    record->inHiPlane = plane;
    record->outLoPlane = plane;
    record->outHiPlane = plane;
    record->inRect = record->filterRect;
    record->outRect = {};
}

// A host that agrees to a request and has no memory for it must not end with the module's reading there.
void expectBuffer(const void* data, const host::Rect& area, int line) {
    const bool isEmpty = area.right <= area.left || area.bottom <= area.top;
    if (!data && !isEmpty)
        throw CGenericEx(QStringLiteral("The host gave no buffer."), kSource, line);
}

// A row of a host buffer; strides may be larger than the row.
std::uint8_t* rowOf(void* data, std::int32_t rowBytes, int y) {
    return static_cast<std::uint8_t*>(data) + static_cast<std::ptrdiff_t>(rowBytes) * y;
}

} // namespace

void CARGBPlanePhotoshop::FillFrom_Photoshop_Data(host::FilterRecord* record, std::int16_t* result) {
    requestPlane(record, 0);
    advance(record, result, "Error.", __LINE__);

    takeShape(record);
    const bool verbose = qEnvironmentVariableIsSet("ORVELA_DEBUG_CARGBPLANE");
    for (int c = 0; c < 3 && c < record->planes; ++c) {
        Log::log(LogLevel::Debug, "CARGBPlanePhotoshop::FillFrom_Photoshop_Data iPlaneID:%d", c);
        requestPlane(record, c);
        advance(record, result, "Error advancing state in FillFrom_Photoshop_Data.", __LINE__);
        if (verbose)
            Log::log(LogLevel::Debug, "CARGBPlane FillFrom_Photoshop_Data plane=%d bpp=%d ", c,
                     record->depth);
        copyFromInput(record, samples(kChannels[static_cast<std::size_t>(c)]));
    }
    if (colorMode() == Grayscale) {
        Log::log(LogLevel::Debug, "Grayscale mode.");
        std::copy_n(samples(Channel::Red), pixelCount(), samples(Channel::Blue));
        std::copy_n(samples(Channel::Red), pixelCount(), samples(Channel::Green));
    }
}

void CARGBPlanePhotoshop::takeShape(const host::FilterRecord* record) {
    const host::Rect area = record->filterRect;
    const std::int32_t w = area.right - area.left;
    const std::int32_t h = area.bottom - area.top;
    Log::log(LogLevel::Debug, "FillFrom_Photoshop_Data bottom=%d top=%d", area.bottom, area.top);
    Log::log(LogLevel::Debug, "FillFrom_Photoshop_Data right=%d left=%d", area.right, area.left);
    Log::log(LogLevel::Debug, "FillFrom_Photoshop_Data w=%d h=%d", w, h);
    Log::log(LogLevel::Debug, "FillFrom_Photoshop_Data no planes=%d", record->planes);
    if (record->planes == 3 || record->planes == 4)
        setColorMode(Color);
    else if (record->planes == 1 || record->planes == 2)
        setColorMode(Grayscale);
    resize(w, h);
}

void CARGBPlanePhotoshop::copyFromInput(const host::FilterRecord* record, std::uint8_t* samples) const {
    expectBuffer(record->inData, record->inRect, __LINE__);
    const auto w = static_cast<std::size_t>(width());
    for (int y = 0; y < height(); ++y, samples += w) {
        const std::uint8_t* in = rowOf(record->inData, record->inRowBytes, y);
        if (record->depth == 8) {
            std::copy_n(in, w, samples);
        } else if (record->depth == 16) {
            const auto* in16 = reinterpret_cast<const std::uint16_t*>(in);
            for (std::size_t x = 0; x < w; ++x)
                samples[x] =
                    static_cast<std::uint8_t>(std::min(static_cast<float>(in16[x]) * kFrom16, 255.0F));
        }
    }
}

void CARGBPlanePhotoshop::copyPlaneToPS(host::FilterRecord* record, std::int16_t* result) {
    switch (record->planes) {
    case 3:
    case 4:
        for (const Channel channel : kChannels)
            writeChannel(static_cast<int>(channel), samples(channel), record, result);
        setColorMode(Color);
        break;
    case 1:
        writeChannel(0, samples(Channel::Red), record, result);
        setColorMode(Grayscale);
        break;
    case 2:
        writeChannel(0, samples(Channel::Blue), record, result);
        writeOpaque(1, record, result);
        setColorMode(Grayscale);
        break;
    default:
        throw CGenericEx(QStringLiteral("Unknown no of planes."), kSource, __LINE__);
    }
    Log::log(LogLevel::Debug, "CARGBPlanePhotoshop::color Mode: %d", colorMode());
    record->inRect = {};
    record->outRect = {};
    advance(record, result, "Error.", __LINE__);
}

void CARGBPlanePhotoshop::writeOpaque(int channel, host::FilterRecord* record, std::int16_t* result) {
    const std::vector<std::uint8_t> opaque(static_cast<std::size_t>(pixelCount()), 255);
    writeChannel(channel, opaque.data(), record, result);
}

void CARGBPlanePhotoshop::writeChannel(int channel, const std::uint8_t* samples, host::FilterRecord* record,
                                       std::int16_t* result) {
    Log::log(LogLevel::Debug, "CARGBPlanePhotoshop::copyPlaneToPS iPlaneID:%d", channel);
    record->outLoPlane = static_cast<std::int16_t>(channel);
    record->outHiPlane = static_cast<std::int16_t>(channel);
    record->inRect = {};
    record->outRect = record->filterRect;
    advance(record, result, "Error advancing state in copyPlaneToPS.", __LINE__);
    copyToOutput(record, samples);
}

void CARGBPlanePhotoshop::copyToOutput(host::FilterRecord* record, const std::uint8_t* samples) const {
    expectBuffer(record->outData, record->outRect, __LINE__);
    const auto w = static_cast<std::size_t>(width());
    for (int y = 0; y < height(); ++y, samples += w) {
        if (record->depth == 8) {
            std::copy_n(samples, w, rowOf(record->outData, record->outRowBytes, y));
        } else if (record->depth == 16) {
            // Whole 16-bit cells per row, whatever the stride in bytes.
            auto* out = static_cast<std::uint16_t*>(record->outData) +
                        static_cast<std::ptrdiff_t>(record->outRowBytes / 2) * y;
            for (std::size_t x = 0; x < w; ++x)
                out[x] = static_cast<std::uint16_t>(static_cast<float>(samples[x]) * kTo16);
        }
    }
}
