#include "Core/CThreadedCore_FinalTouch.h"
#include "Core/CThreadedCore_Orvela.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Utility/CGenericEx.h"
#include "Utility/RowScheduler.h"
#include "support/LogCapture.h"
#include "support/TestPlanes.h"

#include <QMetaMethod>
#include <QThread>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

using testing::ElementsAre;

// Runs a core over a picture and answers its announcements.
struct Session {
    Session(std::unique_ptr<CARGBPlane> picture, EGUIMode mode)
        : in(std::move(picture)), out(*in, QStringLiteral("out")), proxy(*in), core(in.get(), &out) {
        core.setParams(CUserParamsPhotoshop(mode));
        QObject::connect(
            &core, &CThreadedCore::stepDone, &core, [this](int step, int total, const QString& name) {
                steps.push_back(QStringLiteral("%1/%2 %3").arg(step).arg(total).arg(name).toStdString());
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
    CThreadedCore_Orvela core;
    std::vector<std::string> steps;
    std::vector<int> percents;
    std::function<void(const QString&)> onStep;
};

TEST(CThreadedCore, AnnouncesEveryStepOfTheMainPipeline) {
    Session session(testplanes::noise(32, 24), Mode_MacroPro);
    session.core.run();
    const std::vector<std::string> names = {"Sharp_Smart",
                                            "Histogram (00)",
                                            "Histogram (0)",
                                            "Auto_Gamma",
                                            "Histogram (0)",
                                            "Orvela (Iteration Phase I)",
                                            "Orvela (Iteration Phase II)",
                                            "Histo_I",
                                            "Auto_Contrast_I",
                                            "Super_ORV_II",
                                            "Smart Blur",
                                            "Auto_Color",
                                            "Clarity",
                                            "NEW Auto_Contrast",
                                            "Saturation",
                                            "Noise",
                                            "Black & White spot",
                                            "Gamma",
                                            "Contrast",
                                            "Moire",
                                            "Temperature",
                                            "Color",
                                            "Dark_Level",
                                            "Middle_Level",
                                            "Light_Level",
                                            " Contrast_Brightness_Perceptual",
                                            "Histogram XI",
                                            "cAuto_Contrast_TEST",
                                            "Histogram III",
                                            "Gamma_Perceptual",
                                            "Level_Dark_Perceptual",
                                            "Level_Middle_Perceptual",
                                            "Level_Light_Perceptual",
                                            "Histogram XI",
                                            "cAuto_Contrast_TEST II",
                                            "Auto_Gamma"};
    std::vector<std::string> expected = {"0/1 Duplicating Input Plane"};
    for (std::size_t i = 0; i < names.size(); ++i)
        expected.push_back(std::to_string(i) + "/34 " + names[i]);
    expected.emplace_back("1/1 All Done");
    EXPECT_EQ(session.steps, expected);
    EXPECT_TRUE(session.core.lastProcessingDone());
    EXPECT_EQ(session.percents.back(), 100);
    EXPECT_EQ(testplanes::bytes(*session.in), testplanes::bytes(session.out));
}

TEST(CThreadedCore, SpotStepIsAnnouncedOnlyWhenSpotsAreRemoved) {
    Session session(testplanes::noise(16, 16), Mode_Advanced);
    session.core.run();
    EXPECT_EQ(session.steps[17], "16/34 Gamma");
    EXPECT_EQ(session.steps.size(), 37U);
    EXPECT_FALSE(testing::Matches(testing::Contains(testing::HasSubstr("spot")))(session.steps));
}

TEST(CThreadedCore, StoppedRunWalksOnWithoutFurtherChange) {
    Session session(testplanes::noise(64, 64), Mode_LandscapePro);
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
    std::unique_ptr<QThread> helper(QThread::create([&] {
        while (!done) {
            core.stop();
            QThread::msleep(1);
        }
    }));
    helper->start();
    core.run(); // nobody handles its steps
    done = true;
    helper->wait();
    EXPECT_TRUE(core.lastProcessingDone());
}

class FailingCore final : public CThreadedCore {
public:
    using CThreadedCore::CThreadedCore;

protected:
    bool doRun() override {
        emitPercentDone(40);
        throw CGenericEx(QStringLiteral("broken"), "x", 1);
    }
};

TEST(CThreadedCore, FailureIsAnnouncedAndForgotten) {
    LogCapture log;
    auto in = testplanes::noise(8, 8);
    CARGBPlane out(*in, QStringLiteral("out"));
    FailingCore core(in.get(), &out);
    std::vector<std::string> steps;
    std::vector<int> percents;
    QObject::connect(&core, &CThreadedCore::stepDone, &core, [&](int, int, const QString& name) {
        steps.push_back(name.toStdString());
        core.stepHandled();
    });
    QObject::connect(&core, &CThreadedCore::percentDone, &core,
                     [&](int percent) { percents.push_back(percent); });
    core.run();
    EXPECT_THAT(steps, ElementsAre("Duplicating Input Plane", "Failed"));
    EXPECT_THAT(percents, ElementsAre(40, 0));
    EXPECT_FALSE(core.lastProcessingDone());
    EXPECT_TRUE(log.has("Core/CThreadedCore 50"));
    EXPECT_TRUE(ExceptionStack::entries().isEmpty());
}

TEST(CThreadedCore, ProgressComesOnTheRunsThreadAndItsHandlersCanStop) {
    const orvela::RowScheduler scheduler(2);
    Session session(testplanes::noise(900, 2400), Mode_LandscapePro);
    int onOtherThread = 0;
    QObject::connect(&session.core, &CThreadedCore::percentDone, &session.core, [&](int percent) {
        onOtherThread += QThread::currentThread() != session.core.thread();
        if (percent != 0 && percent != 100)
            session.core.stop();
    });
    int applied = 0;
    session.core.setObserver([&](const TaskReport& report) { applied += report.applied; });
    session.core.run();
    EXPECT_EQ(onOtherThread, 0);
    EXPECT_TRUE(session.core.params().mCancelRequested) << "a percentage arrived while rows were worked on";
    EXPECT_LT(applied, 20);
}

TEST(CThreadedCore, FinalTouchAlwaysStartsFromItsOriginal) {
    auto in = testplanes::noise(40, 30);
    CARGBPlane out(*in, QStringLiteral("out"));
    const CARGBPlaneProxyDirect proxy(*in);
    const auto original = testplanes::bytes(*in);
    CThreadedCore_FinalTouch core(in.get(), &out);
    QObject::connect(&core, &CThreadedCore::stepDone, &core, [&] { core.stepHandled(); });
    in->copyFrom(*testplanes::uniform(40, 30, {1, 2, 3}));
    core.setParams(CUserParamsPhotoshop(Mode_FinalTouch));
    core.run();
    EXPECT_EQ(testplanes::bytes(*in), original);
    EXPECT_EQ(testplanes::bytes(out), original);
    EXPECT_TRUE(core.params().Final_Touch_Mode_Enabled);
}

// The names of the tasks, in order, "~" for the prefix "CSmartAnalyzer_Perceptual_".
std::string namesOf(std::span<const PipelineTask> tasks) {
    QStringList names;
    for (const PipelineTask& task : tasks)
        names << QString::fromLatin1(task.name).replace("CSmartAnalyzer_Perceptual_", "~");
    return names.join(' ').toStdString();
}

TEST(CThreadedCore, TasksWithoutAnAnnouncementStandInTheirPlaces) {
    std::vector<std::string> several;
    for (const PipelineStep& step : PipelineTable::mainSteps())
        if (step.tasks.size() > 1)
            several.push_back(namesOf(step.tasks));
    EXPECT_THAT(several,
                ElementsAre("Super_ORV CHistogram_IV", "CClarity CHistogram_VII", "CMoire CAverage",
                            "CColor CHistogram_VII", "CLevel_Light_Right CHistogram_VII ~Contrast_Brightness",
                            "CContrast_Brightness_Perceptual CHistogram_VIII "
                            "CSmartAnalyzer_Digital_Flash CDigital_Flash_Perceptual",
                            "CHistogram_III ~Level_Dark ~Level_Middle ~Level_Right"));
    EXPECT_EQ(
        namesOf(PipelineTable::finalTouchTasks()),
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
