#include "PluginEntry/Module/ModuleCall.h"

namespace orvela {

ModuleCall& ModuleCall::current() {
    static ModuleCall call;
    return call;
}

} // namespace orvela
