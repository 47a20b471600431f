#include "Filters/IFilter.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Settings/SettingsStore.h"
#include "SmartAnalyzers/ISmartAnalyzer.h"
#include "Utility/CGenericEx.h"
#include "Utility/RowScheduler.h"
#include "support/LogCapture.h"
#include "support/TestPlanes.h"

#include <QDir>
#include <QStringList>
#include <QTemporaryDir>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <mutex>
#include <set>

using namespace orvela;

namespace {

using testing::ElementsAre;

// A filter whose phases do as told and that writes 200 to every sample of its rows.
class ScriptedFilter final : public IFilter {
public:
    ScriptedFilter(CUserParams* params, CARGBPlane* in, CARGBPlane* out) : IFilter(params, in, out) {
        mName = "Scripted";
    }

    using IFilter::GetRGBFromHost;

    bool pre = true;
    bool post = true;
    int throwAtRow = -1;
    std::uint32_t start = 0;
    std::uint32_t end = 0;
    std::uint32_t step = 1;
    std::set<std::uint32_t> rows;
    std::vector<std::string> phases;

protected:
    bool PreApply() override {
        phases.emplace_back("pre");
        if (end != 0) {
            mVertStart = start;
            mVertEnd = end;
            mVertStep = step;
        }
        return pre;
    }
    void ApplyRow(std::uint32_t row) override {
        beginRow(row, "Filters/Scripted", 7);
        const Row out = mOutPlane->row(static_cast<int>(row));
        for (std::uint8_t* channel : out)
            std::fill_n(channel, mOutPlane->width(), std::uint8_t{200});
        {
            const std::lock_guard lock(mMutex);
            rows.insert(row);
        }
        if (static_cast<int>(row) == throwAtRow)
            throw 5;
    }
    bool PostApply() override {
        phases.emplace_back("post");
        return post;
    }
    void onSuccess() override {
        phases.emplace_back("success");
        IFilter::onSuccess();
    }

private:
    std::mutex mMutex;
};

struct TaskTest : testing::Test {
    CUserParams params;
    std::unique_ptr<CARGBPlane> in = testplanes::uniform(4, 7, {10, 20, 30});
    std::unique_ptr<CARGBPlane> out = testplanes::uniform(4, 7, {10, 20, 30});
    ScriptedFilter filter{&params, in.get(), out.get()};
};

TEST_F(TaskTest, PhasesRunInOrderAndTheOutputBecomesTheInput) {
    LogCapture log;
    EXPECT_TRUE(filter.Apply());
    EXPECT_THAT(filter.phases, ElementsAre("pre", "post", "success"));
    EXPECT_EQ(testplanes::at(*in, 3, 6), (testplanes::Pixel{200, 200, 200}));
    ASSERT_EQ(log.lines().size(), 8U);
    EXPECT_EQ(log.lines()[0], "-> PreApply");
    EXPECT_EQ(log.lines()[6], "onSuccess copying from out to in");
}

TEST_F(TaskTest, QuietStopsSkipTheLaterPhases) {
    LogCapture log;
    filter.pre = false;
    EXPECT_FALSE(filter.Apply());
    EXPECT_TRUE(filter.rows.empty());
    EXPECT_TRUE(log.has("<- Task canceled in PreApply."));
    ScriptedFilter late(&params, in.get(), out.get());
    late.post = false;
    EXPECT_FALSE(late.Apply());
    EXPECT_THAT(late.phases, ElementsAre("pre", "post"));
    EXPECT_TRUE(log.has("<- Task canceled in PostApply."));
    EXPECT_EQ(testplanes::bytes(*in), testplanes::bytes(*out)) << "the output is put back";
    EXPECT_EQ(testplanes::at(*in, 0, 0), (testplanes::Pixel{10, 20, 30}));
}

TEST_F(TaskTest, RowRangesOfStartEndAndStep) {
    filter.end = 5;
    filter.step = 2;
    EXPECT_TRUE(filter.Apply());
    EXPECT_THAT(filter.rows, ElementsAre(0, 2));

    ScriptedFilter inner(&params, in.get(), out.get());
    inner.start = 1;
    inner.end = 6;
    EXPECT_TRUE(inner.Apply());
    EXPECT_THAT(inner.rows, ElementsAre(1, 2, 3, 4, 5));

    for (const auto& [start, end] :
         {std::pair{3U, 3U}, std::pair{3U, 2U}, std::pair{0U, static_cast<unsigned>(-4)}}) {
        ScriptedFilter empty(&params, in.get(), out.get());
        empty.start = start;
        empty.end = end;
        EXPECT_TRUE(empty.Apply());
        EXPECT_TRUE(empty.rows.empty());
    }
}

TEST_F(TaskTest, FailuresOnWorkersEndThePassAndLeaveBothPlanesAsTheyWere) {
    for (const int threads : {1, 2, 7}) {
        const orvela::RowScheduler scheduler(threads);
        LogCapture log;
        ScriptedFilter failing(&params, in.get(), out.get());
        failing.throwAtRow = 3;
        EXPECT_FALSE(failing.Apply());
        EXPECT_THAT(failing.phases, ElementsAre("pre"));
        EXPECT_TRUE(log.has("<- Unable to complete filter block."));
        EXPECT_EQ(testplanes::bytes(*in), testplanes::bytes(*testplanes::uniform(4, 7, {10, 20, 30})));
        EXPECT_EQ(testplanes::bytes(*out), testplanes::bytes(*in));
    }
}

TEST_F(TaskTest, StopRequestEndsThePassBeforeAnyLaterRow) {
    ExceptionStack::clear();
    params.mProgressCallback = [this](int) { params.mCancelRequested = true; };
    const orvela::RowScheduler scheduler(1);
    EXPECT_FALSE(filter.Apply());
    EXPECT_EQ(filter.rows.size(), 1U);
    EXPECT_TRUE(ExceptionStack::entries()[0].startsWith("Filters/Scripted:7 CGenericEx User canceled."));
    EXPECT_EQ(testplanes::at(*out, 0, 0), (testplanes::Pixel{10, 20, 30}));
    ExceptionStack::clear();
}

TEST_F(TaskTest, RowsReportTheirPercentage) {
    std::set<int> percents;
    params.mProgressCallback = [&percents](int percent) { percents.insert(percent); };
    const orvela::RowScheduler scheduler(1);
    EXPECT_TRUE(filter.Apply());
    // 100 / 7 = 14.2857 in single precision, times 1 to 7.
    EXPECT_THAT(percents, ElementsAre(14, 28, 42, 57, 71, 85, 100));
}

TEST_F(TaskTest, DumpsAreNumberedInTheirOrder) {
    const QTemporaryDir folder;
    qputenv("TEMP", folder.path().toLocal8Bit());
    openSettings().setValue("2000/GUI/dumpImageAfterFile", 1);
    EXPECT_TRUE(filter.Apply());
    EXPECT_TRUE(ScriptedFilter(&params, in.get(), out.get()).Apply());
    openSettings().remove("2000/GUI/dumpImageAfterFile");
    qunsetenv("TEMP");
    const QStringList files = QDir(folder.path()).entryList(QDir::Files, QDir::Name);
    EXPECT_EQ(files, QStringList({"image_after_Scripted_0_4x7.raw", "image_after_Scripted_1_4x7.raw"}));
}

TEST_F(TaskTest, MissingObjectsAreReportedByTheConstructor) {
    LogCapture log;
    EXPECT_THROW(ScriptedFilter(nullptr, in.get(), out.get()), CBadPtrEx);
    EXPECT_THROW(ScriptedFilter(&params, in.get(), nullptr), CBadPtrEx);
    EXPECT_TRUE(log.has("The User Settings object was invalid."));
    EXPECT_TRUE(log.has("The Output plane was invalid!"));
    ExceptionStack::clear();
}

TEST_F(TaskTest, HostPixelsNeedTheDirectProxyAndComeFromItsCopy) {
    std::uint32_t r = 0;
    std::uint32_t g = 0;
    std::uint32_t b = 0;
    EXPECT_DEATH(ScriptedFilter::GetRGBFromHost(0, 0, r, g, b),
                 "IFilter::GetRGBFromHost: \"This version of GetRGBFromHost requires direct proxy.\", file "
                 "Filters/IFilter, line 89");
    CARGBPlaneProxyDirect proxy(*testplanes::noise(4, 7));
    ScriptedFilter::GetRGBFromHost(3, 5, r, g, b);
    const testplanes::Pixel expected = testplanes::at(*testplanes::noise(4, 7), 3, 5);
    EXPECT_THAT((std::array{r, g, b}), ElementsAre(expected[0], expected[1], expected[2]));
    EXPECT_DEATH(proxy.getPixels(0, 0, 1, 1, nullptr, 0),
                 "\"Do not use this method for CARGBPlaneProxyDirect!\"");
}

class FailingAnalyzer final : public ISmartAnalyzer {
public:
    using ISmartAnalyzer::ISmartAnalyzer;

protected:
    void Prepare() override {}
    void Analyze() override { throw 1; }
};

TEST_F(TaskTest, AnalyzerFailuresReachTheCaller) {
    const auto messageOf = [](CUserParams* p, CARGBPlane* plane) {
        try {
            FailingAnalyzer(p, plane).Apply();
        } catch (const CGenericEx& failure) {
            return failure.message().toStdString() + "@" + std::to_string(failure.line());
        }
        return std::string();
    };
    EXPECT_EQ(messageOf(&params, in.get()), "An error occured while running a SmartAnalyzer object.@40");
    EXPECT_EQ(messageOf(nullptr, in.get()), "The User Settings object was invalid.@26");
    EXPECT_EQ(messageOf(&params, nullptr), "The analyzer has an invalid Input plane.@31");
    ExceptionStack::clear();
}

TEST(RowScheduler, PiecesHalveDownToTheGrainAndCoverTheRange) {
    std::mutex mutex;
    std::set<std::pair<unsigned, unsigned>> pieces;
    orvela::forEachRange(0, 202, 200, [&](unsigned begin, unsigned end) {
        const std::lock_guard lock(mutex);
        pieces.insert({begin, end});
    });
    EXPECT_THAT(pieces, ElementsAre(std::pair{0U, 101U}, std::pair{101U, 202U}));
}

} // namespace
