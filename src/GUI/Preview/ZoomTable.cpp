#include "GUI/Preview/ZoomTable.h"

#include <QCoreApplication>

#include <algorithm>
#include <array>
#include <cmath>

namespace orvela {

namespace ZoomTable {

namespace {

constexpr std::array<double, 30> kPercentages = {1,   1.5,  2,   3,    4,    5,    6.25, 8.33, 12.5, 16.7,
                                                 25,  33.3, 50,  66.7, 100,  150,  200,  250,  300,  400,
                                                 500, 600,  800, 1000, 1200, 1700, 2200, 3000, 4000, 5000};
static_assert(kPercentages[kFit] == 100);

} // namespace

std::span<const double> percentages() {
    return kPercentages;
}

int nearest(double percent) {
    const auto distance = [percent](double entry) { return std::abs(std::log(entry / percent)); };
    const auto found = std::min_element(kPercentages.begin(), kPercentages.end(),
                                        [&](double a, double b) { return distance(a) < distance(b); });
    return static_cast<int>(found - kPercentages.begin());
}

QString text(int step) {
    return QCoreApplication::translate("ZoomTable", "%1%", "percentage")
        .arg(kPercentages.at(static_cast<std::size_t>(step)));
}

} // namespace ZoomTable

} // namespace orvela
