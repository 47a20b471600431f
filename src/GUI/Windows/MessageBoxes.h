#pragma once

/// Lets the engine's warnings and debug warnings appear as modal message boxes.
void installMessageBoxes();
