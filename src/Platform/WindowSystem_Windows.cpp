#include "Platform/WindowSystem.h"

namespace orvela {

WindowSystem reachWindowSystem() {
    return {"windows", nullptr};
}

} // namespace orvela
