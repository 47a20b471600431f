#include "Filters/CTemperature.h"

#include "Filters/Kernels/RowMapping.h"

using namespace orvela;

namespace {

constexpr std::array<float, 17> kKelvin = {2000, 2105, 2222, 2353, 2500, 2677, 2857, 3077, 3333,
                                           3636, 4000, 4444, 5000, 5714, 6667, 8000, 10000};
constexpr float kTempCubicDivisor = 140000;
constexpr int kDarkestSum = 91; // a mean brightness above 30

std::int32_t intervalOf(int kelvin) {
    const auto temperature = static_cast<float>(kelvin);
    for (std::size_t i = 0; i + 1 < kKelvin.size(); ++i) {
        if (kKelvin[i] <= temperature && temperature <= kKelvin[i + 1])
            return static_cast<std::int32_t>(i);
    }
    return 0;
}

} // namespace

const TaskDescription& CTemperature::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/CTemperature",
        .line = 72,
        .opening = "Applying CTemperature filter from plane at 0x%x to plane at 0x%x...",
        .matched = "CTemperature Condition matched.",
        .completion = "CTemperature filter complete.",
    };
    return kDescription;
}

bool CTemperature::applies() {
    return mParams->mSliderParams.Temperature_Enabled;
}

void CTemperature::setUp() {
    const double position = mParams->mSliderParams.Temperature_Value;
    const auto kelvin = static_cast<float>(position * 8000 / 1000 + 2000);
    mInterval = intervalOf(PixelMath::trunc(kelvin));
    prepareGains();
}

// The first component's normalisation is linear in the brightness and cancels it; the second and third divide
// by sums that contain replaced values, so the gains depend on the pixel's brightness.
void CTemperature::prepareGains() {
    const auto t = static_cast<float>(mInterval);
    const float x = 2 * t * t * t / kTempCubicDivisor - 0.0008F * t * t - 0.0081F * t + 0.5349F;
    const float y = 0.0046F * t - (t * t * t / kTempCubicDivisor + 0.0007F * t * t) + 0.4083F;
    for (std::size_t sum = kDarkestSum; sum < mGains.size(); ++sum) {
        const auto mean = static_cast<float>(static_cast<double>(sum) / 3);
        const double Y = mean / 255;
        const double X = static_cast<float>(Y * x / y);
        const double Z = static_cast<float>((1.0 - x - y) * Y / y);
        auto a = static_cast<float>((0.0052 * X - 0.0144 * Y + 1.0092 * Z) * 0.3);
        auto b = static_cast<float>((1.4264 * Y + 0.088 * Z - 0.5151 * X) * 0.3);
        auto c = static_cast<float>((2.364 * X - 0.8965 * Y - 0.468 * Z) * 0.3);
        const auto total = [&] { return static_cast<double>(c) + b + a; };
        a = static_cast<float>(a / total());
        b = static_cast<float>(b / total());
        c = static_cast<float>(c / total());
        mGains[sum] = {c + 1.0, b + 1.0, a + 1.0}; // one formula with the channel: in double
    }
}

void CTemperature::mapRow(const PixelRow& row) const {
    mapPixels(row, [this](int red, int green, int blue) {
        const int sum = red + green + blue;
        if (sum < kDarkestSum)
            return PixelMath::Rgb{red, green, blue};
        const Gains& gains = mGains[static_cast<std::size_t>(sum)];
        const auto r = static_cast<float>(gains.r * red);
        const auto g = static_cast<float>(gains.g * green);
        const auto b = static_cast<float>(gains.b * blue);
        const auto k = static_cast<float>(sum / (static_cast<double>(r) + g + b));
        return PixelMath::keepHue(
            {PixelMath::trunc(r * k), PixelMath::trunc(g * k), PixelMath::trunc(b * k)});
    });
}
