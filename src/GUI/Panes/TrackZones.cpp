#include "GUI/Panes/TrackZones.h"

#include <iterator>
#include <vector>

namespace orvela {

namespace TrackZones {

namespace {

constexpr QRgb kGreen = qRgb(0, 255, 40);
constexpr QRgb kOrange = qRgb(255, 120, 0);
constexpr QRgb kPaleOrange = qRgb(255, 170, 23);
constexpr QRgb kRed = qRgb(255, 40, 0);
constexpr QRgb kBlue = qRgb(0, 0, 255);
constexpr QRgb kLightBlue = qRgb(0, 40, 255);

constexpr int kEnd = 1000;

struct Band {
    int last; ///< position; the next band begins at the position after it
    QRgb color;
};

using Bands = std::vector<Band>;

Bands centred(int greenLast, int orangeLast, QRgb orange = kOrange) {
    return {{199, kRed}, {399, orange}, {greenLast, kGreen}, {orangeLast, orange}, {kEnd, kRed}};
}

Bands bands(int number) {
    const Bands sets[] = {
        {{599, kGreen}, {899, kOrange}, {kEnd, kRed}}, // 1: standard
        centred(887, 943),                             // 2: centred wide
        {{kEnd, kLightBlue}},                          // 3: neutral light
        {{kEnd, kBlue}},                               // 4: neutral
        centred(687, 943),                             // 5: centred final
        {{694, kGreen}, {864, kOrange}, {kEnd, kRed}}, // 6: sharpness
        {{749, kGreen}, {kEnd, kOrange}},              // 7: illumination
        {{699, kGreen}, {kEnd, kOrange}},              // 8: strength
        {{299, kGreen}, {499, kOrange}, {kEnd, kRed}}, // 9: blur
        {{349, kRed}, {499, kOrange}, {kEnd, kGreen}}, // 10: fade
        {{kEnd, kBlue}},                               // 11: neutral
        centred(587, 643),                             // 12: centred gamma
        centred(687, 943, kPaleOrange),                // 13: centred final, all channels
    };
    return number >= 1 && number <= int(std::size(sets)) ? sets[number - 1] : Bands{};
}

} // namespace

QList<ZoneStop> set(int number) {
    QList<ZoneStop> stops;
    int first = 0;
    for (const Band& band : bands(number)) {
        const QColor color(band.color);
        stops.append({double(first), color});
        stops.append({double(band.last), color});
        first = band.last + 1;
    }
    return stops;
}

} // namespace TrackZones

} // namespace orvela
