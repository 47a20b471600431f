#include "Platform/Keyboard.h"

#include <QGuiApplication>

namespace orvela {

namespace Keyboard {

namespace {

constexpr int kHeld = 0x80;

int systemShiftState() {
    return QGuiApplication::queryKeyboardModifiers().testFlag(Qt::ShiftModifier) ? kHeld : 0;
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
