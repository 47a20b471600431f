#include "Library/Utility/CARGBPlaneProxyDirect.h"

#include "support/TestPlanes.h"

#include <gtest/gtest.h>

using namespace orvela;

TEST(CARGBPlaneProxyDirect, LatestIsCurrentAndKeepsItsOwnCopy) {
    const auto plane = testplanes::uniform(3, 2, {9, 8, 7});
    {
        const CARGBPlaneProxyDirect first(*plane);
        CARGBPlaneProxyDirect second(*plane);
        EXPECT_EQ(CARGBPlaneProxy::current(), &second);
        plane->copyFrom(*testplanes::uniform(3, 2, {0, 0, 0}));
        EXPECT_EQ(testplanes::at(second.plane(), 2, 1), (testplanes::Pixel{9, 8, 7}));
        EXPECT_DEATH(second.getPixels(0, 0, 1, 1, nullptr, 0),
                     "\"Do not use this method for CARGBPlaneProxyDirect!\"");
    }
    EXPECT_EQ(CARGBPlaneProxy::current(), nullptr);
}
