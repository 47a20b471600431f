#pragma once

#include <cstdint>

namespace orvela {

/// Does what a host asks of the module: sets up the process, acts, and turns a failure into a message box and
/// a result code. The arguments are those of PluginMain.
/// @throws CGenericEx when the module cannot tell where it is, before anything else
void handleSelector(std::int16_t selector, void* record, std::int16_t* result);

} // namespace orvela
