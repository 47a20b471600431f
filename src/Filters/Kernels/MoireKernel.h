#pragma once

#include "Utility/CARGBPlane.h"

#include <array>

namespace orvela {

/// The pixel operation of the moire guard: where a darkness-biased Gaussian average of the 5x5 neighbourhood
/// lies more than 15 levels from the unprocessed host pixel in all three channels, the host pixel is put
/// back.
///
///     average = sum of min(centre, neighbour) * w / sum of w,   w = 1 / exp(d^2 / D)
///     D = 2 * s^4,   s = position * 1.5 / 1000 + 0.5
///
/// Sums are double, row by row, their quotient a float. The last column and row of the picture never enter a
/// window; a pixel without a window stays as it is.
class MoireKernel {
public:
    static constexpr int kRadius = 2;

    /// @param position  of the slider, 0 to 1000
    explicit MoireKernel(float position);

    /// Writes row y of `out` from the same row of `in` or of the host.
    void applyRow(const CARGBPlane& in, const ConstRow& host, CARGBPlane& out, int y) const;

    /// The plain form of applyRow, pixel by pixel. Same results.
    void applyRowPlain(const CARGBPlane& in, const ConstRow& host, CARGBPlane& out, int y) const;

private:
    struct Tile;

    void decidePixels(const CARGBPlane& in, const ConstRow& host, CARGBPlane& out, int y, int first,
                      int last) const;
    void decideTile(const CARGBPlane& in, const ConstRow& host, CARGBPlane& out, int y, int first,
                    int count) const;
    bool differs(const CARGBPlane& in, const ConstRow& host, int x, int y) const;

    std::array<float, 2 * kRadius* kRadius + 1> mGauss = {};  ///< weights by squared distance
    std::array<float, 2 * kRadius* kRadius + 1> mShares = {}; ///< the same over the sum of a whole window's
};

} // namespace orvela
