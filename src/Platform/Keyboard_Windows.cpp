#include "Platform/Keyboard.h"

#include <windows.h>

namespace orvela {

namespace Keyboard {

namespace {

int systemShiftState() {
    return HIBYTE(GetKeyState(VK_SHIFT));
}

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
