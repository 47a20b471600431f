// Walks over every task that the pipelines know: what all of them must keep to, whatever they compute.

#include "Core/CThreadedCore_FinalTouch.h"
#include "Core/CThreadedCore_Orvela.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Settings/ModeTable.h"
#include "Utility/CGenericEx.h"
#include "Utility/RowScheduler.h"
#include "support/StatisticMap.h"
#include "support/TaskSettings.h"
#include "support/TestPlanes.h"

#include <gtest/gtest.h>

#include <cmath>
#include <set>

using namespace orvela;

namespace {

using testplanes::bytes;
using testplanes::Pixel;
using Picture = std::function<std::unique_ptr<CARGBPlane>(int width, int height)>;

const std::vector<std::pair<const char*, Picture>>& pictures() {
    const auto plain = [](Pixel colour) {
        return [colour](int w, int h) { return testplanes::uniform(w, h, colour); };
    };
    const auto drawn = [](auto pixel) {
        return [pixel](int w, int h) {
            return testplanes::make(w, h, [=](int x, int y) { return pixel(x, y, w); });
        };
    };
    static const std::vector<std::pair<const char*, Picture>> all = {
        {"black", plain({0, 0, 0})},
        {"white", plain({255, 255, 255})},
        {"one colour", plain({31, 120, 200})},
        {"red", plain({255, 0, 0})},
        {"two colours", drawn([](int x, int, int width) {
             return x < width / 2 ? Pixel{20, 30, 40} : Pixel{250, 240, 10};
         })},
        {"primaries", drawn([](int x, int y, int) {
             const int place = (x + y) % 3;
             return Pixel{static_cast<std::uint8_t>(place == 0 ? 255 : 0),
                          static_cast<std::uint8_t>(place == 1 ? 255 : 0),
                          static_cast<std::uint8_t>(place == 2 ? 255 : 0)};
         })},
        {"noise", [](int w, int h) { return testplanes::noise(w, h); }},
    };
    return all;
}

// A measured picture, ready for one task.
struct Scene {
    Scene(std::unique_ptr<CARGBPlane> picture, const std::string& task, float position = 700)
        : params(tasksettings::paramsFor(task, position)), in(std::move(picture)), proxy(*in) {
        CARGBPlane out(*in, QString());
        tasksettings::measure(params, *in, out);
    }
    CUserParamsPhotoshop params;
    std::unique_ptr<CARGBPlane> in;
    CARGBPlaneProxyDirect proxy;
};

// What a task makes of a scene: its outcome, the picture, every statistic and two of the histograms.
struct Result {
    Result(const PipelineTask& task, const Scene& scene, std::uint32_t garbage = 99)
        : params(scene.params), out(testplanes::noise(scene.in->width(), scene.in->height(), garbage)) {
        CARGBPlane in(*scene.in, QString());
        applied = task.make({}, &params, &in, out.get())->Apply();
        picture = bytes(in);
    }
    bool operator==(const Result& other) const {
        return applied == other.applied && picture == other.picture &&
               statistics(params) == statistics(other.params) &&
               params.pHisto_Luma == other.params.pHisto_Luma &&
               params.pHisto_Blue == other.params.pHisto_Blue;
    }
    CUserParamsPhotoshop params;
    std::unique_ptr<CARGBPlane> out; ///< what it holds beforehand must never show
    bool applied;
    std::vector<std::uint8_t> picture;
};

void expectFinite(const CUserParams& params) {
    for (const auto& [name, value] : statistics(params))
        EXPECT_TRUE(std::isfinite(value)) << name;
    for (std::size_t i = 0; i < 256; ++i)
        EXPECT_TRUE(std::isfinite(params.pHisto_Luma[i]) && params.pHisto_Luma[i] >= 0);
}

const std::pair<int, int> kSmallSizes[] = {{0, 0}, {1, 1}, {1, 9}, {9, 1}, {2, 2}, {3, 3}, {5, 5}, {4, 40}};
// Around every place where a filter changes its mind.
constexpr int kPositions[] = {0, 1, 499, 500, 501, 599, 600, 601, 900, 901, 1000};

TEST(TaskWalker, WithoutItsSwitchesATaskLeavesThePictureAlone) {
    const std::set<std::string> always = {"Sharp_Smart", "CAverage"};
    for (const PipelineTask& task : tasksettings::allTasks()) {
        if (task.kind != TaskKind::Filter || always.count(task.name))
            continue;
        SCOPED_TRACE(task.name);
        const Scene off(testplanes::noise(40, 30), "none");
        const Result result(task, off);
        EXPECT_FALSE(result.applied);
        EXPECT_EQ(result.picture, bytes(*off.in));
        EXPECT_TRUE(Result(task, Scene(testplanes::noise(40, 30), task.name)).applied)
            << "with its switches in support/TaskSettings.h";
    }
}

// Every position at two sizes; at the others, and for histograms, to which no slider counts, less will do.
bool isTried(const PipelineTask& task, int width, int position) {
    if (task.kind == TaskKind::Histogram)
        return position == 0;
    return position % 500 == 0 || width == 3 || width == 5;
}

void expectHandled(const PipelineTask& task, const Picture& picture, int width, int height) {
    for (const int position : kPositions) {
        if (!isTried(task, width, position))
            continue;
        SCOPED_TRACE(testing::Message() << width << 'x' << height << " at " << position);
        const Scene scene(picture(width, height), task.name, static_cast<float>(position));
        const Result result(task, scene);
        expectFinite(result.params);
        EXPECT_TRUE(position % 500 > 0 || Result(task, scene, 5) == result)
            << "the output plane's old content shows";
    }
}

TEST(TaskWalker, EveryPictureSizeAndSliderPositionIsHandled) {
    RowScheduler scheduler(1); // the pictures are too small to share
    scheduler.execute([] {
        for (const PipelineTask& task : tasksettings::allTasks()) {
            for (const auto& [name, picture] : pictures()) {
                SCOPED_TRACE(testing::Message() << task.name << ' ' << name);
                for (const auto& [width, height] : kSmallSizes)
                    expectHandled(task, picture, width, height);
            }
            ExceptionStack::clear();
        }
    });
}

// Sides above 700 and 1000 pixels; the last picture is above 700 x 700 in all.
TEST(TaskWalker, OneTwoAndSevenThreadsGiveTheSameBytes) {
    for (const auto& [width, height] : {std::pair{1001, 20}, {20, 1001}, {1201, 409}}) {
        const auto picture = testplanes::noise(width, height);
        for (const PipelineTask& task : tasksettings::allTasks()) {
            SCOPED_TRACE(testing::Message() << task.name << ' ' << width << 'x' << height);
            const Scene scene(std::make_unique<CARGBPlane>(*picture, QString()), task.name);
            const auto resultOf = [&](int threads) {
                RowScheduler scheduler(threads);
                std::unique_ptr<Result> result;
                scheduler.execute([&] {
                    result = std::make_unique<Result>(task, scene, static_cast<std::uint32_t>(threads));
                });
                return result;
            };
            const auto one = resultOf(1);
            EXPECT_TRUE(*resultOf(7) == *one);
            EXPECT_TRUE(height == 409 || *resultOf(2) == *one);
        }
    }
}

TEST(TaskWalker, CancelledTasksLeaveThePictureAndWhatTheyMeasureAlone) {
    // The limiter and the empty filter have no row prelude, an analyzer no rows.
    const std::set<std::string> deaf = {"Super_ORV_II", "CAverage"};
    for (const PipelineTask& task : tasksettings::allTasks()) {
        if (task.kind == TaskKind::Analyzer || deaf.count(task.name))
            continue;
        for (const bool beforeTheFirstRow : {true, false}) {
            SCOPED_TRACE(testing::Message() << task.name << (beforeTheFirstRow ? " before" : " during"));
            Scene scene(testplanes::noise(60, 50), task.name);
            const auto before = bytes(*scene.in);
            CARGBPlane out(*testplanes::noise(60, 50, 99), QString());
            const auto untouched = bytes(out);
            CUserParams measured = scene.params;
            scene.params.mCancelRequested = beforeTheFirstRow;
            scene.params.mProgressCallback = [&scene](int) { scene.params.mCancelRequested = true; };
            const auto made = task.make({}, &scene.params, scene.in.get(), &out);
            EXPECT_FALSE(made->Apply());
            EXPECT_EQ(made->outcome(), TaskOutcome::Cancelled);
            EXPECT_EQ(bytes(*scene.in), before);
            EXPECT_TRUE(task.kind == TaskKind::Histogram ||
                        bytes(out) == (beforeTheFirstRow ? untouched : before));
            if (task.kind != TaskKind::Histogram)
                continue;
            if (scene.params.Light_Ave == 0) // two of them clear the averages beforehand
                measured.Dark_Ave = measured.Middle_Ave = measured.Light_Ave = 0;
            EXPECT_EQ(statistics(scene.params), statistics(measured));
            EXPECT_EQ(scene.params.pHisto_Red, measured.pHisto_Red);
        }
        ExceptionStack::clear();
    }
}

TEST(TaskWalker, UniformPicturesStayUniform) {
    // The iterations and the smoothing treat borders apart; the others leave the last row or one pixel.
    const std::set<std::string> uneven = {"COrv_I_Iter", "COrv_II_Iter",
                                          "Super_ORV",   "CLevel_Dark_Left_Perceptual",
                                          "CBilinear",   "CMedian_Salt_Pepper"};
    for (const PipelineTask& task : tasksettings::allTasks()) {
        if (uneven.count(task.name))
            continue;
        for (const Pixel colour :
             {Pixel{0, 0, 0}, Pixel{77, 77, 77}, Pixel{200, 90, 30}, Pixel{255, 255, 255}}) {
            SCOPED_TRACE(testing::Message() << task.name << ' ' << int{colour[0]});
            const std::vector<std::uint8_t> result =
                Result(task, Scene(testplanes::uniform(20, 15, colour), task.name)).picture;
            const Pixel first = {result[0], result[300], result[600]};
            EXPECT_EQ(result, bytes(*testplanes::uniform(20, 15, first)));
        }
    }
}

// Whole runs.
template <typename Core>
void runCore(std::unique_ptr<CARGBPlane> picture, const CUserParamsPhotoshop& params) {
    CARGBPlane out(*picture, QString());
    const CARGBPlaneProxyDirect proxy(*picture);
    Core core(picture.get(), &out);
    QObject::connect(&core, &CThreadedCore::stepDone, &core, [&core] { core.stepHandled(); });
    core.setParams(params);
    core.run();
    EXPECT_TRUE(core.lastProcessingDone());
    EXPECT_EQ(bytes(*picture), bytes(out));
    expectFinite(core.params());
}

TEST(RunWalker, EveryModeHandlesEveryPictureOfEverySmallSize) {
    for (const ModeDescription& mode : ModeTable::all()) {
        if (!mode.hasSettings)
            continue;
        for (const auto& [name, picture] : pictures()) {
            for (const auto& [width, height] : kSmallSizes) {
                SCOPED_TRACE(testing::Message()
                             << mode.displayName << ' ' << name << ' ' << width << 'x' << height);
                runCore<CThreadedCore_Orvela>(picture(width, height), CUserParamsPhotoshop(mode.mode));
            }
        }
    }
}

// All switches, or one alone.
CUserParamsPhotoshop switchedOn(int position, const SliderField* only) {
    CUserParamsPhotoshop params;
    for (const SliderField& field : sliderFields()) {
        if (field.flag)
            params.mSliderParams.*field.flag = !only || field.flag == only->flag;
        else
            params.mSliderParams.*field.value = static_cast<float>(position);
    }
    return params;
}

TEST(RunWalker, EverySwitchOnAtEveryPosition) {
    for (const int position : kPositions) {
        for (const auto& [name, picture] : pictures()) {
            SCOPED_TRACE(testing::Message() << name << " at " << position);
            runCore<CThreadedCore_FinalTouch>(picture(9, 8), switchedOn(position, nullptr));
            runCore<CThreadedCore_Orvela>(picture(9, 8), switchedOn(position, nullptr));
        }
        for (const SliderField& only : sliderFields()) {
            for (const std::size_t i : {5U, 6U}) { // primaries and noise
                if (!only.flag)
                    continue;
                SCOPED_TRACE(testing::Message() << only.name << " alone at " << position);
                const Picture& picture = pictures()[i].second;
                runCore<CThreadedCore_FinalTouch>(picture(9, 8), switchedOn(position, &only));
                runCore<CThreadedCore_Orvela>(picture(9, 8), switchedOn(position, &only));
            }
        }
    }
}

} // namespace
