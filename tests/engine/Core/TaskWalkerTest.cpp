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

// A measured picture, ready for one task. What the output plane holds beforehand must never show.
struct Scene {
    Scene(std::unique_ptr<CARGBPlane> picture, const std::string& task, float position = 700,
          std::uint32_t garbage = 99)
        : params(tasksettings::paramsFor(task, position)), in(std::move(picture)),
          out(*testplanes::noise(in->width(), in->height(), garbage), QString()), proxy(*in) {
        tasksettings::measure(params, *in, out);
    }
    CUserParamsPhotoshop params;
    std::unique_ptr<CARGBPlane> in;
    CARGBPlane out;
    CARGBPlaneProxyDirect proxy;
};

void expectFinite(const CUserParams& params) {
    for (const auto& [name, value] : statistics(params))
        EXPECT_TRUE(std::isfinite(value)) << name;
    for (std::size_t i = 0; i < 256; ++i)
        EXPECT_TRUE(std::isfinite(params.pHisto_Luma[i]) && params.pHisto_Luma[i] >= 0);
}

const std::pair<int, int> kSmallSizes[] = {{0, 0}, {1, 1}, {1, 9}, {9, 1}, {2, 2}, {3, 3}, {5, 5}, {4, 100}};
const std::pair<int, int> kLargeSizes[] = {{701, 699}, {1001, 999}, {1200, 4}};

TEST(TaskWalker, WithoutItsSwitchesATaskLeavesThePictureAlone) {
    const std::set<std::string> always = {"Sharp_Smart", "CAverage"};
    for (const PipelineTask& task : PipelineTable::allTasks()) {
        if (task.kind != TaskKind::Filter || always.count(task.name))
            continue;
        SCOPED_TRACE(task.name);
        Scene scene(testplanes::noise(40, 30), "none");
        const auto before = bytes(*scene.in);
        EXPECT_FALSE(task.make({}, &scene.params, scene.in.get(), &scene.out)->Apply());
        EXPECT_EQ(bytes(*scene.in), before);
        Scene on(testplanes::noise(40, 30), task.name);
        EXPECT_TRUE(task.make({}, &on.params, on.in.get(), &on.out)->Apply());
    }
}

TEST(TaskWalker, EveryPictureSizeAndSliderPositionIsHandled) {
    for (const PipelineTask& task : PipelineTable::allTasks()) {
        for (const auto& [name, picture] : pictures()) {
            for (const auto& [width, height] : kSmallSizes) {
                for (const int position : {0, 1, 499, 500, 501, 599, 600, 601, 900, 901, 1000}) {
                    SCOPED_TRACE(testing::Message() << task.name << ' ' << name << ' ' << width << 'x'
                                                    << height << " at " << position);
                    Scene scene(picture(width, height), task.name, static_cast<float>(position));
                    task.make({}, &scene.params, scene.in.get(), &scene.out)->Apply();
                    expectFinite(scene.params);
                }
            }
        }
        ExceptionStack::clear();
    }
}

std::vector<std::uint8_t> resultOf(const PipelineTask& task, int width, int height, int threads) {
    RowScheduler scheduler(threads);
    Scene scene(testplanes::noise(width, height), task.name, 700, static_cast<std::uint32_t>(threads));
    scheduler.execute([&] { task.make({}, &scene.params, scene.in.get(), &scene.out)->Apply(); });
    auto result = bytes(*scene.in);
    const auto add = [&result](const auto& values) {
        const auto* first = reinterpret_cast<const std::uint8_t*>(std::data(values));
        result.insert(result.end(), first, first + std::size(values) * sizeof(double));
    };
    add(scene.params.pHisto_Luma);
    add(scene.params.pHisto_Blue);
    for (const auto& field : statistics(scene.params))
        add(std::array{field.second});
    return result;
}

TEST(TaskWalker, OneTwoAndSevenThreadsGiveTheSameBytes) {
    for (const PipelineTask& task : PipelineTable::allTasks()) {
        for (const auto& [width, height] : kLargeSizes) {
            SCOPED_TRACE(testing::Message() << task.name << ' ' << width << 'x' << height);
            const auto one = resultOf(task, width, height, 1);
            EXPECT_TRUE(resultOf(task, width, height, 2) == one);
            EXPECT_TRUE(resultOf(task, width, height, 7) == one);
        }
    }
}

TEST(TaskWalker, CancelledTasksLeaveThePictureAlone) {
    for (const PipelineTask& task : PipelineTable::allTasks()) {
        // The limiter and the empty filter have no row prelude, an analyzer no rows.
        const std::set<std::string> deaf = {"Super_ORV_II", "CAverage"};
        if (task.kind == TaskKind::Analyzer || deaf.count(task.name))
            continue;
        for (const bool beforeTheFirstRow : {true, false}) {
            SCOPED_TRACE(testing::Message() << task.name << (beforeTheFirstRow ? " before" : " during"));
            Scene scene(testplanes::noise(60, 50), task.name);
            const auto before = bytes(*scene.in);
            const CUserParams measured = scene.params;
            scene.params.mCancelRequested = beforeTheFirstRow;
            scene.params.mProgressCallback = [&scene](int) { scene.params.mCancelRequested = true; };
            EXPECT_FALSE(task.make({}, &scene.params, scene.in.get(), &scene.out)->Apply());
            EXPECT_EQ(bytes(*scene.in), before);
            if (task.kind == TaskKind::Histogram) {
                EXPECT_EQ(scene.params.pHisto_Red, measured.pHisto_Red);
            } else {
                EXPECT_EQ(bytes(scene.out), before);
            }
        }
        ExceptionStack::clear();
    }
}

TEST(TaskWalker, UniformPicturesStayUniform) {
    // The iterations and the smoothing treat borders apart; the others leave the last row or one pixel.
    const std::set<std::string> uneven = {"COrv_I_Iter", "COrv_II_Iter",
                                          "Super_ORV",   "CLevel_Dark_Left_Perceptual",
                                          "CBilinear",   "CMedian_Salt_Pepper"};
    for (const PipelineTask& task : PipelineTable::allTasks()) {
        if (uneven.count(task.name))
            continue;
        for (const Pixel colour :
             {Pixel{0, 0, 0}, Pixel{77, 77, 77}, Pixel{200, 90, 30}, Pixel{255, 255, 255}}) {
            SCOPED_TRACE(testing::Message() << task.name << ' ' << int{colour[0]});
            Scene scene(testplanes::uniform(20, 15, colour), task.name);
            task.make({}, &scene.params, scene.in.get(), &scene.out)->Apply();
            const Pixel first = testplanes::at(*scene.in, 0, 0);
            EXPECT_EQ(bytes(*scene.in), bytes(*testplanes::uniform(20, 15, first)));
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
    ExceptionStack::clear();
}

TEST(RunWalker, EverySwitchOnAtEveryPosition) {
    for (const bool finalTouch : {false, true}) {
        for (const int position : {0, 1, 499, 500, 501, 599, 600, 601, 900, 901, 1000}) {
            for (const auto& [name, picture] : pictures()) {
                SCOPED_TRACE(testing::Message()
                             << (finalTouch ? "final touch " : "main ") << name << " at " << position);
                // Each switch alone, then all together.
                for (std::size_t only = 0; only <= sliderFields().size(); ++only) {
                    CUserParamsPhotoshop params;
                    for (std::size_t i = 0; i < sliderFields().size(); ++i) {
                        const SliderField& field = sliderFields()[i];
                        if (field.flag)
                            params.mSliderParams.*field.flag = i == only || only == sliderFields().size();
                        else
                            params.mSliderParams.*field.value = static_cast<float>(position);
                    }
                    if (only < sliderFields().size() && !sliderFields()[only].flag)
                        continue;
                    if (finalTouch)
                        runCore<CThreadedCore_FinalTouch>(picture(9, 8), params);
                    else
                        runCore<CThreadedCore_Orvela>(picture(9, 8), params);
                }
            }
        }
    }
    ExceptionStack::clear();
}

} // namespace
