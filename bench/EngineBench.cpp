// Every task alone and whole runs at 1, 6 and 24 megapixels: nanoseconds per pixel, and as a ratio to P, a
// plain row-parallel copy of three planes measured in the same process (machines differ, ratios hardly),
// beside the bar that a task is held to at 24 megapixels. ORVELA_BENCH_THREADS sets the number of threads.

#include "Bars.h"
#include "Core/CThreadedCore_Orvela.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Utility/RowScheduler.h"
#include "support/TaskSettings.h"
#include "support/TestPlanes.h"

#include <QCoreApplication>

#include <benchmark/benchmark.h>

#include <chrono>
#include <cmath>
#include <cstring>
#include <iostream>

using namespace orvela;

namespace {

struct Size {
    const char* name;
    int width;
    int height;
};

constexpr Size kSizes[] = {{"1MP", 1224, 816}, {"6MP", 3000, 2000}, {"24MP", 6000, 4000}};

// Soft shapes of many scales with a little noise: the statistics of an ordinary photograph.
std::unique_ptr<CARGBPlane> makePicture(const Size& size) {
    std::uint32_t state = 7;
    return testplanes::make(size.width, size.height, [&](int x, int y) {
        const double u = static_cast<double>(x) / size.width;
        const double v = static_cast<double>(y) / size.height;
        const double light = 118 + 70 * std::sin(5 * u + 3 * v) + 30 * std::sin(41 * u) * std::cos(37 * v) +
                             14 * std::sin(x * 0.11) * std::sin(y * 0.13);
        testplanes::Pixel pixel;
        for (std::size_t c = 0; c < 3; ++c) {
            state = state * 1664525U + 1013904223U;
            const double noise = static_cast<int>(state >> 28) - 7.5;
            const double tint = 1 + 0.25 * std::sin(4 * v + 2 * static_cast<double>(c));
            pixel[c] = static_cast<std::uint8_t>(std::clamp(light * tint + noise, 0.0, 255.0));
        }
        return pixel;
    });
}

// A picture with everything that a task needs around it.
struct Scene {
    explicit Scene(const Size& size)
        : original(makePicture(size)), in(*original, QStringLiteral("in")),
          out(*original, QStringLiteral("out")), proxy(*original) {}
    std::unique_ptr<CARGBPlane> original;
    CARGBPlane in;
    CARGBPlane out;
    CARGBPlaneProxyDirect proxy;
};

double seconds(const std::function<void()>& action) {
    const auto start = std::chrono::steady_clock::now();
    action();
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
}

// P: the shortest of many copies, row by row.
double copySeconds(Scene& scene) {
    const auto width = static_cast<std::size_t>(scene.in.width());
    double best = 1e9;
    for (int round = 0; round < 15; ++round) {
        best = std::min(best, seconds([&] {
                            orvela::forEachRange(0, static_cast<unsigned>(scene.in.height()), 1,
                                                 [&](unsigned begin, unsigned end) {
                                                     for (unsigned y = begin; y < end; ++y) {
                                                         const ConstRow in =
                                                             std::as_const(scene.in).row(static_cast<int>(y));
                                                         const Row out = scene.out.row(static_cast<int>(y));
                                                         for (std::size_t c = 0; c < 3; ++c)
                                                             std::memcpy(out[c], in[c], width);
                                                     }
                                                 });
                        }));
    }
    return best;
}

Scene& sceneOf(const Size& size) {
    static std::unique_ptr<Scene> scene;
    if (!scene || scene->in.width() != size.width) {
        scene.reset();
        scene = std::make_unique<Scene>(size);
    }
    return *scene;
}

// Times `action` once per iteration on a fresh copy of the picture.
void measure(benchmark::State& state, const Size& size, const std::function<void(Scene&)>& action) {
    Scene& scene = sceneOf(size);
    const double copy = copySeconds(scene);
    double best = 1e9;
    for (auto _ : state) {
        scene.in.copyFrom(*scene.original);
        scene.out.copyFrom(*scene.original);
        const double elapsed = seconds([&] { action(scene); });
        best = std::min(best, elapsed);
        state.SetIterationTime(elapsed);
    }
    const double pixels = scene.in.pixelCount();
    state.counters["ns/px"] = best * 1e9 / pixels;
    state.counters["xP"] = best / copy;
}

void benchTask(benchmark::State& state, const PipelineTask& task, const Size& size) {
    CUserParamsPhotoshop measured = tasksettings::paramsFor(task.name);
    Scene& scene = sceneOf(size);
    tasksettings::measure(measured, scene.in, scene.out);
    state.counters["bar"] = barOf(task.name);
    measure(state, size, [&](Scene& each) {
        CUserParamsPhotoshop params = measured;
        task.make({}, &params, &each.in, &each.out)->Apply();
    });
}

void benchRun(benchmark::State& state, EGUIMode mode, const Size& size) {
    measure(state, size, [mode](Scene& scene) {
        CThreadedCore_Orvela core(&scene.in, &scene.out);
        QObject::connect(&core, &CThreadedCore::stepDone, &core, [&core] { core.stepHandled(); });
        core.setParams(CUserParamsPhotoshop(mode));
        core.run();
    });
}

// The same tasks without a core, and so without announcements and progress: what those cost is the
// difference.
void benchBareRun(benchmark::State& state, EGUIMode mode, const Size& size) {
    measure(state, size, [mode](Scene& scene) {
        CUserParamsPhotoshop params(mode);
        scene.out.copyFrom(scene.in);
        for (const PipelineStep& step : PipelineTable::mainSteps()) {
            for (const PipelineTask& task : step.tasks) {
                if (!task.condition || task.condition(params))
                    task.make({}, &params, &scene.in, &scene.out)->Apply();
                if (task.afterwards)
                    task.afterwards(params);
            }
        }
    });
}

// Every task has a bar, and every bar a task.
void checkBars() {
    for (const PipelineTask& task : tasksettings::allTasks())
        barOf(task.name);
    for (const Bar& bar : kBars)
        tasksettings::taskNamed(bar.task);
}

void registerAll() {
    const std::pair<const char*, EGUIMode> modes[] = {{"Automatic", Mode_Automatic},
                                                      {"LandscapePro", Mode_LandscapePro}};
    for (const Size& size : kSizes) {
        const auto add = [&size](const std::string& name, const auto& body) {
            benchmark::RegisterBenchmark((name + "/" + size.name).c_str(), body)
                ->UseManualTime()
                ->Unit(benchmark::kMillisecond);
        };
        for (const PipelineTask& task : tasksettings::allTasks())
            add(std::string("task/") + task.name,
                [task, &size](benchmark::State& state) { benchTask(state, task, size); });
        for (const auto& [name, mode] : modes) {
            add(std::string("run/") + name,
                [mode = mode, &size](benchmark::State& s) { benchRun(s, mode, size); });
            add(std::string("bare/") + name,
                [mode = mode, &size](benchmark::State& s) { benchBareRun(s, mode, size); });
        }
    }
}

} // namespace

int main(int argc, char** argv) {
    QCoreApplication application(argc, argv);
    const int threads = qEnvironmentVariableIntValue("ORVELA_BENCH_THREADS");
    try {
        checkBars();
    } catch (const std::invalid_argument& failure) {
        std::cerr << failure.what() << '\n';
        return 1;
    }
    registerAll();
    benchmark::Initialize(&argc, argv);
    RowScheduler(threads).execute([] { benchmark::RunSpecifiedBenchmarks(); });
    return 0;
}
