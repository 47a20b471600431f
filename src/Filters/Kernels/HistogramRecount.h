#pragma once

#include "Settings/CUserParams.h"
#include "Utility/CARGBPlane.h"

namespace orvela {

/// Replaces the four histograms of `params` with counts taken from `plane`; nothing else changes. The rows
/// are cut into pieces of at most 200 by halving, and the sampled rows start anew at each piece's first row;
/// every columnStep-th column is sampled from column 0 to the last. A sample counts rowStep * columnStep.
/// Ignores stop requests and reports no progress.
void recountHistograms(const CARGBPlane& plane, CUserParams& params, unsigned rowStep, unsigned columnStep);

} // namespace orvela
