#include "Platform/HelpViewer.h"

namespace orvela {

bool HelpViewer::show(WId, const QString&) {
    return false;
}

} // namespace orvela
