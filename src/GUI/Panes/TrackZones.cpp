#include "GUI/Panes/TrackZones.h"

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

Bands bands(ZoneSet zones) {
    switch (zones) {
    case ZoneSet::Standard:
        return {{599, kGreen}, {899, kOrange}, {kEnd, kRed}};
    case ZoneSet::CentredWide:
        return centred(887, 943);
    case ZoneSet::NeutralLight:
        return {{kEnd, kLightBlue}};
    case ZoneSet::Neutral:
    case ZoneSet::NeutralSingle:
        return {{kEnd, kBlue}};
    case ZoneSet::CentredFinal:
        return centred(687, 943);
    case ZoneSet::Sharpness:
        return {{694, kGreen}, {864, kOrange}, {kEnd, kRed}};
    case ZoneSet::Illumination:
        return {{749, kGreen}, {kEnd, kOrange}};
    case ZoneSet::Strength:
        return {{699, kGreen}, {kEnd, kOrange}};
    case ZoneSet::Blur:
        return {{299, kGreen}, {499, kOrange}, {kEnd, kRed}};
    case ZoneSet::Fade:
        return {{349, kRed}, {499, kOrange}, {kEnd, kGreen}};
    case ZoneSet::CentredGamma:
        return centred(587, 643);
    case ZoneSet::CentredFinalPale:
        return centred(687, 943, kPaleOrange);
    }
    return {};
}

} // namespace

QList<ZoneStop> set(ZoneSet zones) {
    QList<ZoneStop> stops;
    int first = 0;
    for (const Band& band : bands(zones)) {
        const QColor color(band.color);
        stops.append({double(first), color});
        stops.append({double(band.last), color});
        first = band.last + 1;
    }
    return stops;
}

} // namespace TrackZones

} // namespace orvela
