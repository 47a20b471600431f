#include "PluginEntry/PluginMain.h"

#include "Platform/FilterRecord.h"
#include "PluginEntry/Module/Selectors.h"

void PluginMain(std::int16_t selector, void* record, std::intptr_t*, std::int16_t* result) {
    try {
        orvela::handleSelector(selector, record, result);
    } catch (...) { // before anything is there to tell it with
        *result = orvela::host::UserCanceledErr;
    }
}
