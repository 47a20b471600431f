// Every case of the reference data: data/worked holds numbers worked out by hand, data/generated the results
// of data/generators, which work out the same formulas in another language.

#include "support/ReferenceCases.h"

#include "Filters/Kernels/HistogramRecount.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Utility/CGenericEx.h"
#include "support/LogCapture.h"
#include "support/ParamsText.h"
#include "support/StatisticMap.h"
#include "support/TaskSettings.h"

#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <cmath>
#include <set>

using namespace orvela;

namespace {

namespace fs = std::filesystem;
using testplanes::bytes;

std::vector<fs::path> files() {
    std::vector<fs::path> found;
    for (const char* folder : {"worked", "generated"}) {
        for (const auto& entry : fs::directory_iterator(fs::path(ORVELA_TEST_DATA) / folder))
            found.push_back(entry.path());
    }
    return found;
}

std::array<Histogram*, 4> histograms(CUserParams& params) {
    return {&params.pHisto_Luma, &params.pHisto_Red, &params.pHisto_Green, &params.pHisto_Blue};
}

double valueOf(CUserParams& params, const QString& name) {
    const double* const bin = namedBin(params, name);
    return bin ? *bin : statistics(params).at(name.toStdString());
}

// A case on its way: the task's parameters, its planes and what they were before.
class CaseRun {
public:
    explicit CaseRun(const ReferenceCase& each) : mCase(each) {
        const QStringList size = each.text("in").section(' ', 0, 0).split('x');
        mWidth = referencecases::number(size.value(0));
        mHeight = referencecases::number(size.value(1));
        mIn = picture(each.text("in").section(' ', 1));
        if (each.has("writes"))
            markStatistics(mParams);
        setFields(mParams, each.settings);
        if (each.has("counted"))
            recountHistograms(*mIn, mParams, 1, 1);
        for (std::size_t h = 0; each.has("pattern") && h < 4; ++h) {
            for (std::size_t i = 0; i < 256; ++i)
                (*histograms(mParams)[h])[i] = static_cast<double>((i * 37 + 11 * h) % 101);
        }
        mParams.mCancelRequested = each.has("stops");
        mBefore = bytes(*mIn);
        mStatistics = statistics(mParams);
    }

    void apply() {
        const auto host = picture(mCase.has("host") ? mCase.text("host") : mCase.text("in").section(' ', 1));
        const CARGBPlaneProxyDirect proxy(*host);
        const auto out = testplanes::noise(mWidth, mHeight, 7); // must never show
        ExceptionStack::clear();
        const LogCapture log;
        const auto task =
            tasksettings::taskNamed(mCase.task).make({.proxy = &proxy}, &mParams, mIn.get(), out.get());
        task->Apply();
        checkOutcome(*task);
        for (const QString& line : texts("log"))
            EXPECT_TRUE(log.has(line.toStdString())) << line.toStdString();
        for (const QString& line : texts("silent"))
            EXPECT_FALSE(log.has(line.toStdString())) << line.toStdString();
        checkPixels();
        checkStatistics();
    }

private:
    std::unique_ptr<CARGBPlane> picture(const QString& pixels) const {
        return referencecases::picture(mWidth, mHeight, pixels);
    }

    QStringList texts(const std::string& keyword) const {
        QStringList all;
        const auto [first, last] = mCase.fields.equal_range(keyword);
        for (auto field = first; field != last; ++field)
            all.append(field->second);
        return all;
    }

    void checkOutcome(const TaskBase& task) const {
        const TaskOutcome expected = mCase.has("skipped") ? TaskOutcome::Skipped
                                     : mCase.has("stops") ? TaskOutcome::Cancelled
                                                          : TaskOutcome::Applied;
        EXPECT_EQ(task.outcome(), expected);
        for (const QString& source : texts("stops"))
            EXPECT_EQ(ExceptionStack::entries().value(0), source + " CGenericEx User canceled.");
    }

    void checkPixels() const {
        const bool stays = mCase.has("skipped") || mCase.has("same") || mCase.has("stops");
        EXPECT_TRUE(!stays || bytes(*mIn) == mBefore) << "the picture was to stay as it was";
        const auto expected = picture(mCase.has("out") ? mCase.text("out") : QStringLiteral("0"));
        for (int i = 0; mCase.has("out") && i < mWidth * mHeight; ++i) {
            const int x = i % mWidth;
            const int y = i / mWidth;
            ASSERT_EQ(testplanes::at(*mIn, x, y), testplanes::at(*expected, x, y)) << "at " << x << ',' << y;
        }
        for (const QString& text : texts("at")) {
            const QStringList place = text.section(' ', 0, 0).split(',');
            const int x = referencecases::number(place.value(0));
            const int y = referencecases::number(place.value(1));
            EXPECT_EQ(testplanes::at(*mIn, x, y), referencecases::pixel(text.section(' ', 1)))
                << x << ',' << y;
        }
    }

    void checkStatistics() {
        for (const auto& [keyword, tolerance] : {std::pair{"stat", 1e-6}, {"writes", 1e-12}}) {
            for (const QString& word : texts(keyword).join(' ').split(' ', Qt::SkipEmptyParts)) {
                const QString name = word.section('=', 0, 0);
                const double expected = word.section('=', 1).toDouble();
                EXPECT_NEAR(valueOf(mParams, name), expected, tolerance * std::abs(expected))
                    << name.toStdString();
                mStatistics.erase(name.toStdString());
            }
        }
        if (!mCase.has("writes"))
            return;
        for (const auto& [name, value] : mStatistics)
            EXPECT_EQ(valueOf(mParams, QString::fromStdString(name)), value)
                << name << " was not to be written";
    }

    const ReferenceCase& mCase;
    CUserParams mParams;
    int mWidth = 0;
    int mHeight = 0;
    std::unique_ptr<CARGBPlane> mIn;
    std::vector<std::uint8_t> mBefore;
    std::map<std::string, double> mStatistics;
};

class ReferenceCases : public testing::TestWithParam<fs::path> {};

TEST_P(ReferenceCases, Hold) {
    for (const ReferenceCase& each : referencecases::read(GetParam())) {
        SCOPED_TRACE(each.place + " " + each.task + " " + each.settings);
        try {
            CaseRun(each).apply();
        } catch (const std::exception& failure) {
            ADD_FAILURE() << failure.what();
        }
    }
}

INSTANTIATE_TEST_SUITE_P(All, ReferenceCases, testing::ValuesIn(files()), [](const auto& file) {
    return file.param.stem().string() + "_" + file.param.parent_path().filename().string();
});

TEST(ReferenceFiles, EveryTaskHasCasesInFilesOfItsName) {
    std::set<std::string> named;
    for (const fs::path& file : files()) {
        named.insert(file.stem());
        for (const ReferenceCase& each : referencecases::read(file))
            EXPECT_EQ(each.task, file.stem()) << each.place;
    }
    for (const PipelineTask& task : tasksettings::allTasks())
        EXPECT_TRUE(named.count(task.name)) << task.name << " has no cases";
}

TEST(ReferenceFiles, BadOnesAreReportedWithTheirPlace) {
    const QTemporaryDir folder;
    const fs::path file = fs::path(folder.path().toStdString()) / "bad.txt";
    const std::string good = "CAverage | in 1x1 5 | same\n";
    for (const auto& [text, report] :
         {std::pair{"cases 2\n" + good, "bad.txt:2: 1 cases, stated are 2"},
          {"cases 0\n", "bad.txt:1: 0 cases, stated are 0"},
          {good + good, "bad.txt:2: 1 cases, stated are 0"},
          {"cases 1\n# remark\nCAverage | in 1x1 5 | smae\n", "bad.txt:3: unknown field smae"},
          {"cases 1\nCAverage | in 1x1 5\n", "bad.txt:2: the case expects nothing"}}) {
        std::ofstream(file) << text;
        try {
            referencecases::read(file);
            ADD_FAILURE() << text;
        } catch (const std::runtime_error& failure) {
            EXPECT_STREQ(failure.what(), report);
        }
    }
    EXPECT_THROW(referencecases::read(file / "missing"), std::runtime_error);
    EXPECT_THROW(referencecases::picture(2, 2, "1,2"), std::invalid_argument);
    EXPECT_THROW(referencecases::picture(2, 2, "12x"), std::invalid_argument);
    EXPECT_THROW(referencecases::picture(2, 2, ""), std::invalid_argument);
}

} // namespace
