#include "Utility/CARGBPlane.h"

#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Utility/CGenericEx.h"
#include "support/LogCapture.h"
#include "support/TestPlanes.h"

#include <QFile>
#include <QStringList>
#include <QTemporaryDir>

#include <gtest/gtest.h>

using namespace orvela;

namespace {

TEST(CARGBPlane, EmptyPlaneTakesSizeSamplesAndModeOfItsSource) {
    CARGBPlane plane(0, 480, QStringLiteral("empty"));
    EXPECT_FALSE(plane.isAllocated());
    const auto source = testplanes::noise(640, 480);
    source->setColorMode(CARGBPlane::Grayscale);
    plane.copyFrom(*source);
    EXPECT_EQ(plane.width(), 640);
    EXPECT_EQ(plane.pixelCount(), 307200);
    EXPECT_EQ(plane.colorMode(), CARGBPlane::Grayscale);
    EXPECT_EQ(testplanes::bytes(plane), testplanes::bytes(*source));
    plane.copyFrom(*testplanes::uniform(640, 480, {1, 2, 3}));
    EXPECT_EQ(testplanes::at(plane, 639, 479), (testplanes::Pixel{1, 2, 3}));
}

TEST(CARGBPlane, ParallelCopyIsWholeAcrossBlocks) {
    const auto source = testplanes::noise(1031, 769); // three blocks and a rest
    const CARGBPlane copy(*source, QStringLiteral("copy"));
    EXPECT_EQ(testplanes::bytes(copy), testplanes::bytes(*source));
}

TEST(CARGBPlane, ImpossibleSizesAreOutOfMemory) {
    ExceptionStack::clear();
    EXPECT_THROW(CARGBPlane(70000, 70000, QStringLiteral("huge")), CGenericEx);
    const QStringList entries = ExceptionStack::entries();
    ASSERT_EQ(entries.size(), 2);
    EXPECT_TRUE(entries[0].endsWith("CGenericEx Unable to complete plane creation."));
    EXPECT_TRUE(entries[1].endsWith("COutOfMemoryEx Unable to allocate Planes Memory (Direct error)."));
    ExceptionStack::clear();
}

TEST(CARGBPlane, RawDumpInterleavesTheChannels) {
    const QTemporaryDir folder;
    const QString path = folder.filePath("dump.raw");
    const auto plane = testplanes::make(2, 1, [](int x, int) {
        return x == 0 ? testplanes::Pixel{1, 3, 5} : testplanes::Pixel{2, 4, 6};
    });
    plane->dumpToRaw(path.toLocal8Bit());
    QFile file(path);
    ASSERT_TRUE(file.open(QIODevice::ReadOnly));
    EXPECT_EQ(file.readAll(), QByteArray("\1\3\5\2\4\6"));

    LogCapture log;
    plane->dumpToRaw(folder.filePath("missing/dump.raw").toLocal8Bit());
    EXPECT_TRUE(log.has("Can not open file for writing in CARGBPlane::dumpToRaw"));
}

TEST(PlaneProxy, LatestProxyIsCurrentAndKeepsItsOwnCopy) {
    const auto plane = testplanes::uniform(3, 2, {9, 8, 7});
    {
        const CARGBPlaneProxyDirect first(*plane);
        const CARGBPlaneProxyDirect second(*plane);
        EXPECT_EQ(CARGBPlaneProxy::current(), &second);
        plane->copyFrom(*testplanes::uniform(3, 2, {0, 0, 0}));
        EXPECT_EQ(testplanes::at(second.plane(), 2, 1), (testplanes::Pixel{9, 8, 7}));
    }
    EXPECT_EQ(CARGBPlaneProxy::current(), nullptr);
}

} // namespace
