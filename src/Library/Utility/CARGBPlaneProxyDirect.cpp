#include "Library/Utility/CARGBPlaneProxyDirect.h"

#include <atomic>

using namespace orvela;

namespace {
std::atomic<CARGBPlaneProxy*> gCurrent = nullptr;
}

CARGBPlaneProxy* CARGBPlaneProxy::current() {
    return gCurrent;
}

void CARGBPlaneProxy::setCurrent(CARGBPlaneProxy* proxy) {
    gCurrent = proxy;
}

CARGBPlaneProxyDirect::CARGBPlaneProxyDirect(const CARGBPlane& plane)
    : mPlane(plane, QStringLiteral("Proxy to original image")) {
    setCurrent(this);
}

CARGBPlaneProxyDirect::~CARGBPlaneProxyDirect() {
    if (current() == this)
        setCurrent(nullptr);
}

void CARGBPlaneProxyDirect::getPixels(int, int, int, int, void*, int) {
    qt_assert_x("CARGBPlaneProxyDirect::getPixels", "Do not use this method for CARGBPlaneProxyDirect!",
                "Library/Utility/CARGBPlaneProxyDirect", __LINE__);
}
