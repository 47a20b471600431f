#include "Utility/CARGBPlane.h"

#include "Utility/CGenericEx.h"
#include "support/FailingArrays.h"
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
    try {
        const CARGBPlane huge(46341, 46341, QStringLiteral("huge")); // one pixel more than 32 bits count
        ADD_FAILURE();
    } catch (const CGenericEx& failure) {
        EXPECT_TRUE(isOutOfMemory(failure));
    }
    const QStringList entries = ExceptionStack::entries();
    ASSERT_EQ(entries.size(), 2);
    EXPECT_TRUE(entries[0].endsWith("CGenericEx Unable to complete plane creation."));
    EXPECT_TRUE(entries[1].endsWith("COutOfMemoryEx Unable to allocate Planes Memory (Direct error)."));
}

TEST(CARGBPlane, AFailedCopyLeavesAnEmptyPlaneThatTakesTheNextOne) {
    const auto source = testplanes::noise(16, 9);
    for (const int arrays : {0, 1, 2}) {
        CARGBPlane plane(4, 4, QStringLiteral("plane"));
        try {
            const FailingArrays rest(FailingArrays::kAnySize, arrays);
            plane.copyFrom(*source);
            ADD_FAILURE();
        } catch (const CBadPtrEx& failure) {
            EXPECT_TRUE(isOutOfMemory(failure));
            EXPECT_EQ(innermostMessage(failure), "Unable to allocate plane memory (Indirect error).");
        }
        EXPECT_FALSE(plane.isAllocated());
        EXPECT_EQ(plane.width() + plane.height() + plane.pixelCount(), 0);
        EXPECT_EQ(plane.samples(Channel::Red), nullptr);
        plane.copyFrom(*source);
        EXPECT_EQ(testplanes::bytes(plane), testplanes::bytes(*source));
    }
}

TEST(CARGBPlane, PlanesOfOneSizeExchangeTheirArraysAndMode) {
    const auto noise = testplanes::noise(6, 4);
    const auto before = testplanes::bytes(*noise);
    const std::uint8_t* const array = noise->samples(Channel::Green);
    noise->setColorMode(CARGBPlane::Grayscale);
    const auto flat = testplanes::uniform(6, 4, {1, 2, 3});
    noise->swapSamples(*flat);
    EXPECT_EQ(testplanes::bytes(*flat), before);
    EXPECT_EQ(flat->samples(Channel::Green), array);
    EXPECT_EQ(flat->colorMode(), CARGBPlane::Grayscale);
    EXPECT_EQ(testplanes::at(*noise, 5, 3), (testplanes::Pixel{1, 2, 3}));
    EXPECT_EQ(noise->colorMode(), CARGBPlane::ColorUnset);
    const auto turned = testplanes::uniform(4, 6, {0, 0, 0}); // as many pixels
    EXPECT_THROW(flat->swapSamples(*turned), CBadPtrEx);
    EXPECT_EQ(testplanes::bytes(*flat), before);
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

} // namespace
