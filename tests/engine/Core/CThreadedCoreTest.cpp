#include "Core/CThreadedCore_FinalTouch.h"
#include "Core/CThreadedCore_Orvela.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "SmartAnalyzers/ISmartAnalyzer.h"
#include "Utility/CGenericEx.h"
#include "Utility/RowScheduler.h"
#include "support/FailingArrays.h"
#include "support/LogCapture.h"
#include "support/TestPlanes.h"

#include <QMetaMethod>
#include <QRect>
#include <QThread>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <thread>

using namespace orvela;

namespace {

using testing::ElementsAre;

// Runs a core over a picture and answers its announcements.
template <typename Core = CThreadedCore_Orvela>
struct Session {
    Session(std::unique_ptr<CARGBPlane> picture, EGUIMode mode)
        : in(std::move(picture)), out(*in, QStringLiteral("out")), proxy(*in), core(in.get(), &out) {
        core.setProxy(&proxy);
        core.setParams(CUserParamsPhotoshop(mode));
        QObject::connect(
            &core, &CThreadedCore::stepDone, &core, [this](int step, int total, const QString& name) {
                steps.push_back(QStringLiteral("%1/%2 %3").arg(step).arg(total).arg(name).toStdString());
                titles.emplace_back(core.stepTitle());
                if (onStep)
                    onStep(name);
                core.stepHandled();
            });
        QObject::connect(&core, &CThreadedCore::percentDone, &core,
                         [this](int percent) { percents.push_back(percent); });
    }

    std::unique_ptr<CARGBPlane> in;
    CARGBPlane out;
    CARGBPlaneProxyDirect proxy;
    Core core;
    std::vector<std::string> steps;
    std::vector<std::string> titles;
    std::vector<int> percents;
    std::function<void(const QString&)> onStep;
};

TEST(CThreadedCore, AnnouncesItsStepsAndTheSpotsOnlyWhenTheyAreRemoved) {
    for (const auto& [mode, sixteenth, count] :
         {std::tuple{Mode_MacroPro, "16/34 Black & White spot", 38U}, {Mode_Advanced, "16/34 Gamma", 37U}}) {
        Session<> session(testplanes::noise(32, 24), mode);
        session.core.run();
        ASSERT_EQ(session.steps.size(), count);
        EXPECT_EQ(session.steps.front(), "0/1 Duplicating Input Plane");
        EXPECT_EQ(session.titles.front(), "Copying the picture");
        EXPECT_EQ(session.titles.at(count - 2), "Automatic gamma, second pass");
        for (const std::string& title : session.titles)
            EXPECT_TRUE(title.size() > 3 && title.find('_') == std::string::npos) << title;
        EXPECT_EQ(session.steps[1], "0/34 Sharp_Smart");
        EXPECT_EQ(session.steps[17], sixteenth);
        EXPECT_EQ(session.steps[count - 2], std::to_string(count - 3) + "/34 Auto_Gamma");
        EXPECT_EQ(session.steps.back(), "1/1 All Done");
        EXPECT_TRUE(session.core.lastProcessingDone());
        EXPECT_EQ(session.percents.back(), 100);
        EXPECT_EQ(testplanes::bytes(*session.in), testplanes::bytes(session.out));
    }
}

TEST(CThreadedCore, StoppedRunWalksOnWithoutFurtherChange) {
    Session<> session(testplanes::noise(64, 64), Mode_LandscapePro);
    std::vector<std::uint8_t> atStop;
    session.onStep = [&](const QString& name) {
        if (name == "Orvela (Iteration Phase I)") {
            session.core.stop();
            atStop = testplanes::bytes(*session.in);
        }
    };
    session.core.run();
    EXPECT_EQ(session.steps.back(), "1/1 All Done");
    EXPECT_EQ(session.steps.size(), 37U);
    EXPECT_TRUE(session.core.lastProcessingDone());
    EXPECT_EQ(testplanes::bytes(*session.in), atStop);
    EXPECT_EQ(testplanes::bytes(session.out), atStop);

    const auto before = testplanes::bytes(*session.in);
    session.onStep = nullptr;
    session.core.setParams(CUserParamsPhotoshop(Mode_LandscapePro));
    session.core.run();
    EXPECT_NE(testplanes::bytes(*session.in), before) << "a new run forgets the stop";
}

TEST(CThreadedCore, StopFromAnotherThreadReleasesAWaitingRun) {
    auto in = testplanes::noise(8, 8);
    CARGBPlane out(*in, QStringLiteral("out"));
    const CARGBPlaneProxyDirect proxy(*in);
    CThreadedCore_Orvela core(in.get(), &out);
    core.setParams(CUserParamsPhotoshop(Mode_Advanced));
    std::atomic<bool> done = false;
    std::thread helper([&] {
        while (!done) {
            core.stop();
            QThread::msleep(1);
        }
    });
    core.run(); // nobody handles its steps
    done = true;
    helper.join();
    EXPECT_TRUE(core.lastProcessingDone());
}

// An analyzer without memory, whose failure reaches the run wrapped.
class FailingAnalyzer final : public ISmartAnalyzer {
public:
    using ISmartAnalyzer::ISmartAnalyzer;

protected:
    void Prepare() override {}
    void Analyze() override { throw COutOfMemoryEx(QStringLiteral("no room to count"), "x", 1); }
};

class FailingCore final : public CThreadedCore {
public:
    using CThreadedCore::CThreadedCore;

protected:
    bool doRun() override {
        emitPercentDone(40);
        const auto make = [](const RunContext& context, CUserParams* params, CARGBPlane* in,
                             CARGBPlane*) -> std::unique_ptr<TaskBase> {
            return std::make_unique<FailingAnalyzer>(context, params, in);
        };
        runTask({"FailingAnalyzer", TaskKind::Analyzer, make}, "Failing");
        return true;
    }
};

TEST(CThreadedCore, AnAnalyzersFailureEndsTheRunAndIsForgottenByTheProcess) {
    LogCapture log;
    Session<FailingCore> session(testplanes::noise(8, 8), Mode_Advanced);
    session.core.run();
    EXPECT_THAT(session.steps, ElementsAre("0/1 Duplicating Input Plane", "0/1 Failed"));
    EXPECT_THAT(session.percents, ElementsAre(40, 0));
    EXPECT_FALSE(session.core.lastProcessingDone());
    EXPECT_EQ(session.core.failure().cause, "no room to count");
    EXPECT_TRUE(session.core.failure().outOfMemory);
    ASSERT_EQ(session.core.reports().size(), 1U);
    EXPECT_EQ(session.core.reports()[0].outcome, TaskOutcome::Failed);
    EXPECT_TRUE(log.has("Core/CThreadedCore 50"));
    EXPECT_TRUE(ExceptionStack::entries().isEmpty());
}

// The noise filter finds no memory for its second table; the run is as one without it.
TEST(CThreadedCore, AFailedFilterIsReportedAndTheRunGoesOnWithThePictureAsItWas) {
    std::vector<std::vector<std::uint8_t>> results;
    for (const bool fails : {false, true}) {
        Session<> session(testplanes::noise(40, 30), Mode_Advanced);
        CUserParamsPhotoshop params;
        params.mSliderParams.ContrastEnabled = true;
        params.mSliderParams.ContrastValue = 750;
        params.mSliderParams.BilinearFilteringEnabled = fails;
        session.core.setParams(params);
        const FailingArrays none(195076 * sizeof(float));
        session.core.run();
        EXPECT_EQ(session.steps.back(), "1/1 All Done");
        for (const TaskReport& report : session.core.reports()) {
            const bool failed = report.outcome == TaskOutcome::Failed;
            EXPECT_EQ(failed, fails && report.name == std::string("CBilinear"));
            EXPECT_EQ(report.failure.outOfMemory, failed);
            EXPECT_EQ(report.failure.cause,
                      failed ? "Bilinear filter was unable to declare the m_sBilinear floats array." : "");
        }
        results.push_back(testplanes::bytes(*session.in));
    }
    EXPECT_EQ(results[0], results[1]);
    EXPECT_NE(results[0], testplanes::bytes(*testplanes::noise(40, 30)));
}

// A run with threads of its own, which logs a line at every announcement.
template <typename Core>
std::vector<std::uint8_t> runWith(int threads, int width, int height, const CUserParamsPhotoshop& params) {
    RowScheduler scheduler(threads);
    Session<Core> session(testplanes::noise(width, height, static_cast<std::uint32_t>(width)), Mode_Advanced);
    session.core.setParams(params);
    session.onStep = [](const QString&) { Log::log(LogLevel::Debug, "a step"); };
    scheduler.execute([&] { session.core.run(); });
    EXPECT_TRUE(session.core.lastProcessingDone());
    EXPECT_NE(testplanes::bytes(*session.in), testplanes::bytes(session.proxy.plane()));
    return testplanes::bytes(*session.in);
}

TEST(CThreadedCore, RunsSideBySideGiveWhatTheyGiveAlone) {
    const auto main = [] {
        return runWith<CThreadedCore_Orvela>(3, 233, 150, CUserParamsPhotoshop(Mode_LandscapePro));
    };
    const auto touch = [] {
        CUserParamsPhotoshop params;
        params.mSliderParams.mColor_Touch_Enabled = true;
        params.mSliderParams.mColor_Intensity_Touch_Value = 600;
        params.mSliderParams.mPerceptual_Touch_Dark_RGB_Enabled = true;
        params.mSliderParams.mPerceptual_Touch_Dark_Value_RGB = 900;
        return runWith<CThreadedCore_FinalTouch>(2, 120, 440, params);
    };
    const LogCapture log;
    const auto mainAlone = main();
    const auto touchAlone = touch();
    std::thread other([&] {
        for (int i = 0; i < 6; ++i)
            EXPECT_TRUE(touch() == touchAlone);
    });
    for (int i = 0; i < 3; ++i)
        EXPECT_TRUE(main() == mainAlone);
    other.join();
    const auto steps = std::count_if(log.lines().begin(), log.lines().end(),
                                     [](const std::string& line) { return line.ends_with("a step"); });
    EXPECT_EQ(std::count(log.lines().begin(), log.lines().end(), "a step"), steps) << "none is indented";
    EXPECT_EQ(steps, 4 * 37 + 7 * 2);
}

TEST(CThreadedCore, ASnapshotStaysWhileTheRunGoesOn) {
    Session<> session(testplanes::noise(40, 30), Mode_LandscapePro);
    std::unique_ptr<CARGBPlane> whole;
    std::unique_ptr<CARGBPlane> part;
    std::vector<std::uint8_t> then;
    session.onStep = [&](const QString& name) {
        if (name != "Saturation")
            return;
        then = testplanes::bytes(*session.in);
        whole = session.core.snapshot();
        part = session.core.snapshot({39, 29, 5, 5}, 1);
    };
    session.core.run();
    EXPECT_EQ(testplanes::bytes(*whole), then);
    EXPECT_NE(testplanes::bytes(*session.in), then);
    EXPECT_EQ(testplanes::bytes(*part), (std::vector{then[1199], then[2399], then[3599]}));
}

TEST(CThreadedCore, ProgressComesOnTheRunsThreadAndItsHandlersCanStop) {
    RowScheduler scheduler(2);
    Session<> session(testplanes::noise(900, 2400), Mode_LandscapePro);
    int onOtherThread = 0;
    QObject::connect(&session.core, &CThreadedCore::percentDone, &session.core, [&](int percent) {
        onOtherThread += QThread::currentThread() != session.core.thread();
        if (percent != 0 && percent != 100)
            session.core.stop();
    });
    int applied = 0;
    session.core.setObserver(
        [&](const TaskReport& report) { applied += report.outcome == TaskOutcome::Applied; });
    scheduler.execute([&] { session.core.run(); });
    EXPECT_EQ(onOtherThread, 0);
    EXPECT_TRUE(session.core.params().mCancelRequested) << "a percentage arrived while rows were worked on";
    EXPECT_LT(applied, 20);
}

TEST(CThreadedCore, FinalTouchAlwaysStartsFromItsOriginal) {
    Session<CThreadedCore_FinalTouch> session(testplanes::noise(40, 30), Mode_FinalTouch);
    const auto original = testplanes::bytes(*session.in);
    session.in->copyFrom(*testplanes::uniform(40, 30, {1, 2, 3}));
    session.core.run();
    EXPECT_EQ(testplanes::bytes(*session.in), original);
    EXPECT_EQ(testplanes::bytes(session.out), original);
    EXPECT_TRUE(session.core.params().Final_Touch_Mode_Enabled);
}

// The recorded runs know the main pipeline only.
TEST(CThreadedCore, FinalTouchRunsItsTasksInOrder) {
    QStringList names;
    for (const PipelineTask& task : PipelineTable::finalTouchTasks())
        names << QString::fromLatin1(task.name).replace("CSmartAnalyzer_Perceptual_", "~");
    EXPECT_EQ(
        names.join(' ').toStdString(),
        "CHistogram_Luma_Final CContrast_Simple_Filter CColor CHistogram_VII CLevel_Dark_Left "
        "CLevel_Middle CLevel_Light_Right CHistogram0 ~Contrast_Brightness CSpecial_Contrast_Perceptual "
        "CContrast_Brightness_Perceptual CHistogram_III ~Level_Dark CLevel_Dark_Left_Perceptual "
        "CHistogram_III ~Level_Middle CLevel_Middle_Perceptual CHistogram_III ~Level_Right "
        "CLevel_Light_Right_Perceptual");
}

TEST(CThreadedCore, SignalsAndSlotsKeepTheirNumbers) {
    const QMetaObject& meta = CThreadedCore::staticMetaObject;
    std::vector<std::string> signatures;
    for (int i = meta.methodOffset(); i < meta.methodCount(); ++i)
        signatures.push_back(meta.method(i).methodSignature().toStdString());
    EXPECT_THAT(signatures, ElementsAre("stepDone(int,int,QString)", "stepDone(int,int)", "percentDone(int)",
                                        "finished()", "started()", "terminated()", "lastProcessingDone()",
                                        "emitPercentDone(int)"));
}

} // namespace
