// The settings store with ten thousand presets of Advanced, as many as a studio may have gathered: listing
// them, looking for one, reading one, writing and removing one. What the settings library itself needs to
// read and to rewrite its file stands beside it.

#include "Settings/FactoryPresets.h"
#include "Settings/SettingsStore.h"

#include <QCoreApplication>
#include <QTemporaryDir>

#include <benchmark/benchmark.h>

using namespace orvela;

namespace {

constexpr int kPresets = 10000;

QString nameOf(int number) {
    return QStringLiteral("Preset %1").arg(number);
}

void fillStore() {
    SettingsEdit edit;
    const PresetContent content = FactoryPresets::contentOf(QStringLiteral("Automatic"));
    for (int number = 0; number < kPresets; ++number)
        PresetTree::write(edit, Mode_Advanced, nameOf(number), content);
    edit.commit();
}

void libraryReads(benchmark::State& state) {
    for (auto step : state)
        benchmark::DoNotOptimize(openSettings().value(QStringLiteral("2000/GUI/batchMode")));
}
BENCHMARK(libraryReads)->Unit(benchmark::kMillisecond);

void libraryWrites(benchmark::State& state) {
    int count = 0;
    for (auto step : state) {
        QSettings settings = openSettings();
        settings.setValue(QStringLiteral("2000/GUI/batchMode"), ++count);
        settings.sync();
    }
}
BENCHMARK(libraryWrites)->Unit(benchmark::kMillisecond);

void list(benchmark::State& state) {
    for (auto step : state)
        benchmark::DoNotOptimize(PresetTree::names(Mode_Advanced));
}
BENCHMARK(list)->Unit(benchmark::kMillisecond);

void readOne(benchmark::State& state) {
    for (auto step : state)
        benchmark::DoNotOptimize(PresetTree::read(Mode_Advanced, nameOf(7777)));
}
BENCHMARK(readOne)->Unit(benchmark::kMillisecond);

// As for a window that keeps the store open while it is there.
void readOneOfAnOpenStore(benchmark::State& state) {
    const QSettings kept = openSettings();
    for (auto step : state)
        benchmark::DoNotOptimize(PresetTree::read(Mode_Advanced, nameOf(7777)));
}
BENCHMARK(readOneOfAnOpenStore)->Unit(benchmark::kMillisecond);

void writeOne(benchmark::State& state) {
    PresetContent content = FactoryPresets::contentOf(QStringLiteral("Automatic"));
    for (auto step : state) {
        content.sliders[0].value = content.sliders[0].value == 1 ? 2 : 1;
        SettingsEdit edit;
        PresetTree::write(edit, Mode_Advanced, nameOf(5555), content);
        edit.commit();
    }
}
BENCHMARK(writeOne)->Unit(benchmark::kMillisecond);

void writeAndRemoveOne(benchmark::State& state) {
    const PresetContent content = FactoryPresets::contentOf(QStringLiteral("Automatic"));
    for (auto step : state) {
        SettingsEdit edit;
        PresetTree::write(edit, Mode_Advanced, QStringLiteral("new"), content);
        edit.commit();
        SettingsEdit removal;
        PresetTree::remove(removal, Mode_Advanced, QStringLiteral("new"));
        removal.commit();
    }
}
BENCHMARK(writeAndRemoveOne)->Unit(benchmark::kMillisecond);

} // namespace

int main(int argc, char** argv) {
    const QTemporaryDir folder; // nobody's own settings are touched
    qputenv("XDG_CONFIG_HOME", folder.path().toLocal8Bit());
    QCoreApplication application(argc, argv);
    setSettingsApplication(QStringLiteral("OrvelaStoreBench"));
    fillStore();
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    return 0;
}
