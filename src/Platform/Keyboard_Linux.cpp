#include "Platform/Keyboard.h"

#include <QGuiApplication>

namespace orvela {

namespace Keyboard {

namespace {

constexpr int kHeld = 0x80;

} // namespace

int systemShiftState() {
    return QGuiApplication::queryKeyboardModifiers().testFlag(Qt::ShiftModifier) ? kHeld : 0;
}

} // namespace Keyboard

} // namespace orvela
