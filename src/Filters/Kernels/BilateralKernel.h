#pragma once

#include "Utility/CARGBPlane.h"

namespace orvela {

/// The pixel operation of the noise filter: a 3x3 average weighted by distance in place and in colour.
///
///     out = sum of w * c / sum of w,   w = range[D] * spatial[d^2]
///
/// D is the squared colour distance to the pixel (0 to 195075), d^2 the squared distance in pixels (0 to 2);
/// a weight is a float product. Sums are double, row by row, their quotient a float: float sums would darken
/// flat areas by one level.
class BilateralKernel {
public:
    /// The tables are not owned.
    BilateralKernel(const float* spatial, const float* range) : mSpatial(spatial), mRange(range) {}

    /// Smooths row y but for its first and last pixel; there must be a row above and below.
    void applyRow(const CARGBPlane& in, CARGBPlane& out, int y) const;

    /// The plain form of applyRow, pixel by pixel. Same results.
    void applyRowPlain(const CARGBPlane& in, CARGBPlane& out, int y) const;

private:
    struct Tile;

    void smoothTile(Tile& tile) const;
    void weigh(Tile& tile, int wy, int wx, int pixels) const;

    const float* mSpatial;
    const float* mRange;
};

} // namespace orvela
