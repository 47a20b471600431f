// Walks over every task that the pipelines know: what all of them must keep to, whatever they compute.

#include "Core/CThreadedCore_FinalTouch.h"
#include "Core/CThreadedCore_Orvela.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Utility/CGenericEx.h"
#include "Utility/ModeTable.h"
#include "Utility/RowScheduler.h"
#include "support/TaskSettings.h"
#include "support/TestPlanes.h"

#include <gtest/gtest.h>

#include <cmath>
#include <set>

namespace {

using testplanes::bytes;
using testplanes::Pixel;
using Picture = std::function<std::unique_ptr<CARGBPlane>(int width, int height)>;

const std::vector<std::pair<const char*, Picture>>& pictures() {
    const auto plain = [](Pixel colour) {
        return [colour](int w, int h) { return testplanes::uniform(w, h, colour); };
    };
    static const std::vector<std::pair<const char*, Picture>> all = {
        {"black", plain({0, 0, 0})},
        {"white", plain({255, 255, 255})},
        {"one colour", plain({31, 120, 200})},
        {"red", plain({255, 0, 0})},
        {"two colours",
         [](int w, int h) {
             return testplanes::make(w, h, [w](int x, int) {
                 return x < w / 2 ? Pixel{20, 30, 40} : Pixel{250, 240, 10};
             });
         }},
        {"primaries",
         [](int w, int h) {
             return testplanes::make(w, h, [](int x, int y) {
                 Pixel pixel = {0, 0, 0};
                 pixel[static_cast<std::size_t>((x + y) % 3)] = 255;
                 return pixel;
             });
         }},
        {"noise", [](int w, int h) { return testplanes::noise(w, h); }},
    };
    return all;
}

// A measured picture, ready for one task.
struct Scene {
    Scene(std::unique_ptr<CARGBPlane> picture, const std::string& task, float position = 700)
        : params(tasksettings::paramsFor(task, position)), in(std::move(picture)), out(*in, QString()),
          proxy(*in) {
        tasksettings::measure(params, *in, out);
    }
    CUserParamsPhotoshop params;
    std::unique_ptr<CARGBPlane> in;
    CARGBPlane out;
    CARGBPlaneProxyDirect proxy;
};

void expectFinite(const CUserParams& params) {
    const auto check = [](const char* name, double value) { EXPECT_TRUE(std::isfinite(value)) << name; };
#define ORVELA_STATISTIC_FIELD(type, name, value, listed) check(#name, static_cast<double>(params.name));
#define ORVELA_KEPT_FIELD(type, name, listed) check(#name, static_cast<double>(params.name));
#include "Utility/StatisticFields.inc"
    for (std::size_t i = 0; i < 256; ++i)
        EXPECT_TRUE(std::isfinite(params.pHisto_Luma[i]) && params.pHisto_Luma[i] >= 0);
}

const std::pair<int, int> kSmallSizes[] = {{0, 0}, {1, 1}, {1, 9}, {9, 1}, {2, 2}, {3, 3}, {5, 5}, {4, 100}};
const std::pair<int, int> kLargeSizes[] = {{701, 699}, {1001, 999}, {1200, 4}};

TEST(TaskWalker, TheRegistryHoldsEveryTask) {
    int filters = 0;
    int histograms = 0;
    int analyzers = 0;
    std::set<std::string> names;
    for (const PipelineTask& task : PipelineTable::allTasks()) {
        filters += task.kind == TaskKind::Filter;
        histograms += task.kind == TaskKind::Histogram;
        analyzers += task.kind == TaskKind::Analyzer;
        names.insert(task.name);
    }
    EXPECT_EQ(filters, 31);
    EXPECT_EQ(histograms, 7);
    EXPECT_EQ(analyzers, 5);
    for (const auto& [name, flags] : tasksettings::switches())
        EXPECT_EQ(names.count(name), 1U) << name;
}

TEST(TaskWalker, WithoutItsSwitchesATaskLeavesThePictureAlone) {
    const std::set<std::string> always = {"Sharp_Smart", "CAverage"};
    for (const PipelineTask& task : PipelineTable::allTasks()) {
        if (task.kind != TaskKind::Filter || always.count(task.name))
            continue;
        SCOPED_TRACE(task.name);
        Scene scene(testplanes::noise(40, 30), "none");
        const auto before = bytes(*scene.in);
        EXPECT_FALSE(task.make(&scene.params, scene.in.get(), &scene.out)->Apply());
        EXPECT_EQ(bytes(*scene.in), before);
        EXPECT_EQ(bytes(scene.out), before);
        Scene on(testplanes::noise(40, 30), task.name);
        EXPECT_TRUE(task.make(&on.params, on.in.get(), &on.out)->Apply());
        EXPECT_EQ(bytes(*on.in), bytes(on.out));
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
                    task.make(&scene.params, scene.in.get(), &scene.out)->Apply();
                    EXPECT_EQ(bytes(*scene.in), bytes(scene.out));
                    expectFinite(scene.params);
                }
            }
        }
        ExceptionStack::clear();
    }
}

std::vector<std::uint8_t> resultOf(const PipelineTask& task, int width, int height, int threads) {
    const orvela::RowScheduler scheduler(threads);
    Scene scene(testplanes::noise(width, height), task.name);
    task.make(&scene.params, scene.in.get(), &scene.out)->Apply();
    auto result = bytes(*scene.in);
    for (const double bin : scene.params.pHisto_Luma)
        result.push_back(static_cast<std::uint8_t>(static_cast<long>(bin) % 251));
    const auto* sum = reinterpret_cast<const std::uint8_t*>(&scene.params.mSum_Color);
    result.insert(result.end(), sum, sum + sizeof(double));
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
            EXPECT_FALSE(task.make(&scene.params, scene.in.get(), &scene.out)->Apply());
            EXPECT_EQ(bytes(*scene.in), before);
            EXPECT_EQ(bytes(scene.out), before);
            if (task.kind == TaskKind::Histogram) {
                EXPECT_EQ(scene.params.pHisto_Red, measured.pHisto_Red);
            }
        }
        ExceptionStack::clear();
    }
}

// A task whose window or sampling treats places differently, with the reason.
bool mayBreakUniformity(const std::string& task) {
    // The iterations and the smoothing treat borders apart.
    const std::set<std::string> borders = {"COrv_I_Iter", "COrv_II_Iter", "Super_ORV"};
    // These leave the last row or a border of one pixel.
    const std::set<std::string> partial = {"CLevel_Dark_Left_Perceptual", "CBilinear", "CMedian_Salt_Pepper"};
    return borders.count(task) || partial.count(task);
}

TEST(TaskWalker, UniformPicturesStayUniform) {
    for (const PipelineTask& task : PipelineTable::allTasks()) {
        if (mayBreakUniformity(task.name))
            continue;
        for (const Pixel colour :
             {Pixel{0, 0, 0}, Pixel{77, 77, 77}, Pixel{200, 90, 30}, Pixel{255, 255, 255}}) {
            SCOPED_TRACE(testing::Message() << task.name << ' ' << int{colour[0]});
            Scene scene(testplanes::uniform(20, 15, colour), task.name);
            task.make(&scene.params, scene.in.get(), &scene.out)->Apply();
            const Pixel first = testplanes::at(*scene.in, 0, 0);
            EXPECT_EQ(bytes(*scene.in), bytes(*testplanes::uniform(20, 15, first)));
        }
    }
}

// The position at which a filter leaves every value alone.
TEST(TaskWalker, NeutralSettingsAreTheIdentity) {
    const std::map<std::string, float> neutral = {{"CGamma_Simple_Filter", 500},
                                                  {"CGamma_Perceptual", 500},
                                                  {"CContrast_Simple_Filter", 500},
                                                  {"CLevel_Dark_Left", 0},
                                                  {"CLevel_Middle", 500},
                                                  {"CLevel_Dark_Left_Perceptual", 0},
                                                  {"CLevel_Middle_Perceptual", 500},
                                                  {"CLevel_Light_Right_Perceptual", 0}};
    const auto ramp = [](int x, int y) {
        return Pixel{static_cast<std::uint8_t>(x), static_cast<std::uint8_t>(255 - x),
                     static_cast<std::uint8_t>(x * y)};
    };
    for (const auto& [name, position] : neutral) {
        Scene scene(testplanes::make(256, 8, ramp), name, position);
        const auto before = bytes(*scene.in);
        EXPECT_TRUE(tasksettings::run(name, scene.params, *scene.in, scene.out)) << name;
        EXPECT_EQ(bytes(*scene.in), before) << name;
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
