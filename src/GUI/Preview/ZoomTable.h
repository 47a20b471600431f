#pragma once

#include <QString>

#include <span>

namespace orvela {

/// The steps of the preview's zoom, in percent of the size that fits the width of the view.
namespace ZoomTable {

/// Thirty steps, rising.
std::span<const double> percentages();

/// The step of 100 %.
inline constexpr int kFit = 14;

/// The step whose percentage is nearest to `percent`, by ratio.
int nearest(double percent);

/// "16.7%".
QString text(int step);

} // namespace ZoomTable

} // namespace orvela
