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

void CARGBPlaneProxy::leave(CARGBPlaneProxy* proxy) {
    gCurrent.compare_exchange_strong(proxy, nullptr);
}

CARGBPlaneProxyDirect::CARGBPlaneProxyDirect(const CARGBPlane& plane)
    : CARGBPlaneProxyDirect(plane, Private) {
    setCurrent(this);
}

CARGBPlaneProxyDirect::CARGBPlaneProxyDirect(const CARGBPlane& plane, Use)
    : mPlane(plane, QStringLiteral("Proxy to original image")) {}

CARGBPlaneProxyDirect::~CARGBPlaneProxyDirect() {
    leave(this);
}

void CARGBPlaneProxyDirect::getPixels(int, int, int, int, void*, int) {
    qt_assert_x("CARGBPlaneProxyDirect::getPixels", "Do not use this method for CARGBPlaneProxyDirect!",
                "Library/Utility/CARGBPlaneProxyDirect", __LINE__);
}
