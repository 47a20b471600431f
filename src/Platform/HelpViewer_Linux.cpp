#include "Platform/HelpViewer.h"

namespace orvela {

bool HelpViewer::show(void*, const std::string&) {
    return false;
}

} // namespace orvela
