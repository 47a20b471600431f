#pragma once

namespace orvela {

/// Lets the engine's warnings and debug warnings appear as modal message boxes.
void installMessageBoxes();

} // namespace orvela
