#include "PluginEntry/PropertyList.h"

// In a section of its own, where hosts find it. Windows has it as a resource, which the build makes of this
// section.
namespace {

[[gnu::section(ORVELA_PROPERTY_LIST_SECTION), gnu::used]] const auto kPropertyList =
    orvela::PropertyList::kBytes;

} // namespace
