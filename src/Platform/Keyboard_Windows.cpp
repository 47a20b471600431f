#include "Platform/Keyboard.h"

#include <windows.h>

namespace orvela {

namespace Keyboard {

int systemShiftState() {
    return HIBYTE(GetKeyState(VK_SHIFT));
}

} // namespace Keyboard

} // namespace orvela
