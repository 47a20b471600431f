#include "Platform/Keyboard.h"

namespace orvela {

namespace Keyboard {

namespace {

int (*gShiftState)() = systemShiftState;

} // namespace

int shiftState() {
    return gShiftState();
}

void setShiftState(int (*answer)()) {
    gShiftState = answer ? answer : systemShiftState;
}

} // namespace Keyboard

} // namespace orvela
