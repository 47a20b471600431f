#pragma once

namespace orvela {

/// The keys that are held down right now.
namespace Keyboard {

/// The high byte of the SHIFT key's state: not 0 while the key is held.
int shiftState();

/// The same as the system tells it; each has its own source.
int systemShiftState();

/// Has shiftState() answer what `answer` does, for a test; null asks the system again.
void setShiftState(int (*answer)());

} // namespace Keyboard

} // namespace orvela
