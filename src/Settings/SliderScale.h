#pragma once

#include <QString>

namespace orvela {

/// The two-way map between a slider's position (0 to 1000) and the number shown for it.
struct SliderScale {
    double (*toShown)(double position);
    double (*toPosition)(double shown);

    /// The shown number at position 0; above high() on a scale that runs down.
    double low() const { return toShown(0); }
    /// The shown number at position 1000.
    double high() const { return toShown(1000); }

    /// What stands beside a slider at `position`.
    QString text(double position) const;
    /// The position that this text tells, where a slider comes to stand that is moved to `position`.
    double told(double position) const;
};

namespace SliderScales {

/// Decimals of the numbers that stand beside sliders.
inline constexpr int kDecimals = 1;

/// A shown number as it stands beside a slider.
QString textOf(double shown);

/// The gamma of a position, for controls and filters alike: 0.1 at 0, 1 at 500, 10 at 1000, linear in
/// between.
double gammaAt(double position);

extern const SliderScale Tenth;       ///< 0 to 100
extern const SliderScale Hundredth;   ///< 0 to 10
extern const SliderScale Thousandth;  ///< 0 to 1
extern const SliderScale Temperature; ///< 2000 to 10000 K
extern const SliderScale Sharpness;   ///< 30 to 71
extern const SliderScale Noise;       ///< 0.5 to 5
extern const SliderScale Spots;       ///< 0.5 to 100
extern const SliderScale Moire;       ///< 0.1 to 10
extern const SliderScale Contrast;    ///< -100 to 100
extern const SliderScale Brightness;  ///< -255 to 255
extern const SliderScale Gamma;       ///< 0.1 to 10, 1.0 at position 500
extern const SliderScale Shadows;     ///< 0 to 255
extern const SliderScale Highlights;  ///< 255 down to 0

} // namespace SliderScales

} // namespace orvela
