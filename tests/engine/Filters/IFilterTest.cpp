#include "Filters/IFilter.h"

#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Utility/CGenericEx.h"
#include "support/LogCapture.h"
#include "support/ScriptedFilter.h"

#include <QDir>
#include <QTemporaryDir>

#include <gmock/gmock.h>

using namespace orvela;

namespace {

using IFilterTest = ScriptedFilterTest;

TEST_F(IFilterTest, RowsThatAreNotVisitedComeFromTheInput) {
    for (const auto& [start, end] : {std::pair{0U, 7U}, {2U, 5U}, {3U, 2U}}) {
        const auto plane = testplanes::uniform(4, 7, kColour);
        const auto garbage = testplanes::noise(4, 7);
        ScriptedFilter some(&params, plane.get(), garbage.get());
        some.start = start;
        some.end = end;
        EXPECT_TRUE(some.Apply());
        for (std::uint32_t y = 0; y < 7; ++y)
            EXPECT_EQ(testplanes::at(*plane, 3, static_cast<int>(y)),
                      some.rows.count(y) ? (testplanes::Pixel{200, 200, 200}) : kColour)
                << y;
    }
}

TEST_F(IFilterTest, DumpsAreNumberedInTheirOrder) {
    const QTemporaryDir folder;
    qputenv("TEMP", folder.path().toLocal8Bit());
    EXPECT_TRUE(ScriptedFilter(&params, in.get(), out.get(), {.dumpsPictures = true}).Apply());
    EXPECT_TRUE(filter.Apply());
    EXPECT_TRUE(ScriptedFilter(&params, in.get(), out.get(), {.dumpsPictures = true}).Apply());
    qunsetenv("TEMP");
    const QStringList files = QDir(folder.path()).entryList(QDir::Files, QDir::Name);
    EXPECT_EQ(files, QStringList({"image_after_Scripted_0_4x7.raw", "image_after_Scripted_1_4x7.raw"}));
}

TEST_F(IFilterTest, MissingObjectsAreReportedByTheConstructor) {
    LogCapture log;
    EXPECT_THROW(ScriptedFilter(nullptr, in.get(), out.get()), CBadPtrEx);
    EXPECT_THROW(ScriptedFilter(&params, in.get(), nullptr), CBadPtrEx);
    EXPECT_THAT(log.lines(), testing::ElementsAre("The User Settings object was invalid.",
                                                  "The Output plane was invalid!"));
}

TEST_F(IFilterTest, HostPixelsComeFromTheRunsProxyOrElseTheProcessWideOne) {
    const CARGBPlaneProxyDirect own(*testplanes::noise(4, 7));
    const CARGBPlaneProxyDirect latest(*testplanes::noise(4, 7, 2));
    ScriptedFilter withOwn(&params, in.get(), out.get(), {.proxy = &own});
    for (const auto& [each, seed] : {std::pair{&filter, 2U}, {&withOwn, 1U}}) {
        std::array<std::uint32_t, 3> rgb = {};
        each->useHostPicture();
        each->GetRGBFromHost(3, 5, rgb[0], rgb[1], rgb[2]);
        const testplanes::Pixel expected = testplanes::at(*testplanes::noise(4, 7, seed), 3, 5);
        EXPECT_THAT(rgb, testing::ElementsAre(expected[0], expected[1], expected[2]));
    }
}

// A broken promise ends builds with assertions; elsewhere it is an exception.
TEST_F(IFilterTest, HostPixelsNeedADirectProxy) {
#if defined(QT_NO_DEBUG) && !defined(QT_FORCE_ASSERTS)
    try {
        filter.useHostPicture();
        ADD_FAILURE() << "nothing was thrown";
    } catch (const CGenericEx& failure) {
        EXPECT_EQ(failure.message(), "This version of GetRGBFromHost requires direct proxy.");
        EXPECT_EQ(failure.sourceFile() + ' ' + QByteArray::number(failure.line()), "Filters/IFilter 89");
    }
#else
    EXPECT_DEATH(filter.useHostPicture(),
                 "IFilter::GetRGBFromHost: \"This version of GetRGBFromHost requires direct proxy.\", file "
                 "Filters/IFilter, line 89");
#endif
}

} // namespace
