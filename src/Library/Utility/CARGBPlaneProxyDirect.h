#pragma once

#include "Utility/CARGBPlane.h"

/// Source of the host's unprocessed pixels.
class CARGBPlaneProxy {
public:
    virtual void getPixels(int x, int y, int width, int height, void* pixels, int rowBytes) = 0;
    virtual ~CARGBPlaneProxy() = default;

    /// The proxy that the filters of a run read; null when there is none.
    static CARGBPlaneProxy* current();

protected:
    static void setCurrent(CARGBPlaneProxy* proxy);
    /// Leaves no proxy behind if `proxy` is the current one.
    static void leave(CARGBPlaneProxy* proxy);
};

/// Keeps its own copy of a plane and is the process-wide proxy until it is destroyed or another one is made;
/// a private one is only that of the runs that it is given to.
class CARGBPlaneProxyDirect final : public CARGBPlaneProxy {
public:
    /// @throws CGenericEx when the copy cannot be made
    explicit CARGBPlaneProxyDirect(const CARGBPlane& plane);
    enum Use { Private };
    CARGBPlaneProxyDirect(const CARGBPlane& plane, Use use);
    ~CARGBPlaneProxyDirect() override;

    /// A programming error for this proxy: read plane() instead. Aborts.
    void getPixels(int x, int y, int width, int height, void* pixels, int rowBytes) override;

    const CARGBPlane& plane() const { return mPlane; }

private:
    CARGBPlane mPlane;
};
