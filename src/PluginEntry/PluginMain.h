#pragma once

#include <cstdint>

#ifdef _WIN32
#define ORVELA_EXPORT __declspec(dllexport)
#else
#define ORVELA_EXPORT __attribute__((visibility("default")))
#endif

/// The module's only exported function, which a host calls once for each selector. No exception leaves it.
/// @param selector  what to do, an orvela::host::Selector
/// @param record    the host's filter record, for the about selector its about record
/// @param data      a cell that the host keeps for the module, unused
/// @param result    receives an orvela::host::ResultCode
extern "C" ORVELA_EXPORT void PluginMain(std::int16_t selector, void* record, std::intptr_t* data,
                                         std::int16_t* result);
