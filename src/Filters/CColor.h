#pragma once

#include "Filters/IFilter.h"
#include "Filters/Kernels/RowMapping.h"

/// Colour filter: tints every pixel toward a chosen colour T, then restores the pixel's mean brightness.
///
///     c' = trunc(T * v + c * (1 - v)),   c'' = trunc(c' * trunc(mean(c)) / mean(c'))
///
/// v is the intensity / 1000, 0 to 1; results above 255 are rescaled with their hue. Main runs use the
/// colour filter's colour and intensity, final-touch runs the touch colour and intensity.
class CColor final : public IFilter {
public:
    using IFilter::IFilter;

protected:
    bool PreApply() override;
    void ApplyRow(std::uint32_t row) override;

private:
    struct Tint {
        Tint() = default;
        Tint(float intensity, float red, float green, float blue);

        float v = 0;    ///< weight of the colour
        float keep = 1; ///< weight of the pixel
        orvela::WideTables curves = {};
    };

    Tint mNormal;
    Tint mTouch;
};
