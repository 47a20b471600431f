// Stands in for the module behind its entry point: without Qt and windows it answers every selector,
// exchanges a picture with the host as the module does, and tells what the module finds out about itself.
#include "Platform/FilterRecord.h"
#include "Platform/ModuleFile.h"
#include "PluginEntry/Module/Selectors.h"

#include <algorithm>
#include <stdexcept>
#include <string>

namespace orvela {

namespace {

using namespace host;

void require(bool holds, const char* what) {
    if (!holds)
        throw std::runtime_error(what);
}

void tellOwnFile(FilterRecord& record) {
    const std::u8string name = moduleFile().u8string();
    require(name.size() < 256, "the name does not fit into the host's text");
    record.errorString[0] = static_cast<std::uint8_t>(name.size());
    std::copy(name.begin(), name.end(), record.errorString + 1);
}

template <typename Sample>
void invertRow(const void* in, void* out, int count, int highest) {
    const auto* from = static_cast<const Sample*>(in);
    std::transform(from, from + count, static_cast<Sample*>(out),
                   [highest](Sample sample) { return static_cast<Sample>(highest - sample); });
}

void invertBand(FilterRecord& record, const Rect& band, std::int16_t plane) {
    record.inRect = record.outRect = band;
    record.inLoPlane = record.inHiPlane = record.outLoPlane = record.outHiPlane = plane;
    require(record.advanceState() == NoErr, "the host has no data");
    for (int row = 0; row < band.bottom - band.top; ++row) {
        const void* in = static_cast<const char*>(record.inData) + row * record.inRowBytes;
        void* out = static_cast<char*>(record.outData) + row * record.outRowBytes;
        const int count = band.right - band.left;
        if (record.depth == 16)
            invertRow<std::uint16_t>(in, out, count, 32768);
        else
            invertRow<std::uint8_t>(in, out, count, 255);
    }
}

// Plane by plane, and each in bands: many requests.
void invert(FilterRecord& record) {
    constexpr std::int16_t kRows = 5;
    const Rect area = record.filterRect;
    for (std::int16_t plane = 0; plane < record.planes; ++plane)
        for (std::int16_t top = area.top; top < area.bottom; top += kRows) {
            const auto bottom = static_cast<std::int16_t>(std::min(top + kRows, int{area.bottom}));
            invertBand(record, {top, area.left, bottom, area.right}, plane);
        }
    record.inRect = record.outRect = record.maskRect = Rect{};
    require(record.advanceState() == NoErr, "the host does not take the last band");
}

} // namespace

void handleSelector(std::int16_t selector, void* record, std::int16_t* result) {
    auto& filter = *static_cast<FilterRecord*>(record);
    *result = NoErr;
    if (selector == SelectorAbout)
        require(static_cast<AboutRecord*>(record)->platformData->hostWindow == nullptr, "no such window");
    else if (selector == SelectorParameters)
        tellOwnFile(filter);
    else if (selector == SelectorPrepare)
        filter.bufferSpace = filter.maxSpace / 2;
    else if (selector == SelectorStart)
        invert(filter);
    else if (selector == SelectorFinish)
        pinModule();
    else
        *result = FilterBadParameters;
}

} // namespace orvela
