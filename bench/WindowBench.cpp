// How soon the windows react over a photograph of 24 megapixels: to a click while a run goes on, to Stop, to
// a slider that is dragged, to scrolling and zooming. Every figure is in milliseconds, from the event of the
// mouse to the end of the painting that shows its effect; "median" and "most" are of the single reactions.

#include "Core/CThreadedCore.h"
#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Controls/CThinHorizontalSlider.h"
#include "GUI/Preview/CSignaledGraphicsView.h"
#include "GUI/Windows/CDlgDualPreviewImpl.h"
#include "GUI/Windows/CDlgSettingsImpl.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Settings/SettingsStore.h"

#include <QApplication>
#include <QComboBox>
#include <QImage>
#include <QMouseEvent>
#include <QPointingDevice>
#include <QScrollBar>
#include <QTemporaryDir>
#include <QTimer>
#include <QToolButton>

#include <benchmark/benchmark.h>

#include <algorithm>
#include <chrono>
#include <thread>

using namespace orvela;

namespace {

using Clock = std::chrono::steady_clock;

constexpr QSize kPhoto(6000, 4000);
constexpr QSize kPreviews(1600, 700); // both views side by side

double milliseconds(Clock::time_point from, Clock::time_point to = Clock::now()) {
    return std::chrono::duration<double, std::milli>(to - from).count();
}

/// Calls back after each painting of a widget.
class PaintWatch : public QObject {
public:
    explicit PaintWatch(QWidget* widget) : mWidget(widget) { widget->installEventFilter(this); }

    /// The end of the first painting after now; paints what waits for it. Gives up after five seconds.
    Clock::time_point await() {
        const auto start = Clock::now();
        for (mPainted = false; !mPainted && milliseconds(start) < 5000;)
            QCoreApplication::processEvents(QEventLoop::AllEvents, 1);
        return Clock::now();
    }

    bool eventFilter(QObject*, QEvent* event) override {
        if (event->type() != QEvent::Paint || mPainting)
            return false;
        mPainting = true; // the widget paints here, and once only
        QCoreApplication::sendEvent(mWidget, event);
        mPainting = false;
        mPainted = true;
        if (onPainted)
            onPainted();
        return true;
    }

    std::function<void()> onPainted;

private:
    QWidget* mWidget;
    bool mPainting = false;
    bool mPainted = false;
};

/// The processing window of Advanced with its previews.
class Bench {
public:
    Bench(CARGBPlane* input, CARGBPlane* output, const CARGBPlane& original)
        : photo(original), window(Mode_Advanced, input, output) {}

    /// Does `action` while the window is open, with the result of a whole run shown.
    void run(const std::function<void()>& action) {
        const auto user = [&] {
            wait(200);
            window.findChild<CDlgDualPreviewImpl*>()->resize(kPreviews);
            window.findChild<QComboBox*>(QStringLiteral("lstBxPreset"))
                ->setCurrentText(QStringLiteral("LandscapePro"));
            wait(200);
            button("btnRefresh").click();
            action();
            window.reject();
        };
        QTimer start;
        start.setSingleShot(true);
        QObject::connect(&start, &QTimer::timeout, &window, user);
        start.start(0);
        window.run();
    }

    QToolButton& button(const char* name) { return *window.findChild<QToolButton*>(QLatin1String(name)); }

    /// The view of the processed picture.
    CSignaledGraphicsView& view() {
        return *window.findChild<CDlgDualPreviewImpl*>()->findChildren<CSignaledGraphicsView*>().last();
    }

    static void wait(int time) {
        for (const auto start = Clock::now(); milliseconds(start) < time;)
            QCoreApplication::processEvents(QEventLoop::AllEvents, 5);
    }

    /// As the window system does, from any thread.
    static void postClick(QWidget& widget) {
        const QPointF centre = QRectF(widget.rect()).center();
        for (const auto type : {QEvent::MouseButtonPress, QEvent::MouseButtonRelease})
            QCoreApplication::postEvent(
                &widget, new QMouseEvent(type, centre, widget.mapToGlobal(centre), Qt::LeftButton,
                                         type == QEvent::MouseButtonPress ? Qt::LeftButton : Qt::NoButton,
                                         Qt::NoModifier));
    }

    const CARGBPlane& photo; ///< as it came
    CDlgSettingsImpl window;
};

Bench* gBench = nullptr;

double copyMilliseconds(const CARGBPlane& picture) {
    std::vector<double> all;
    CARGBPlane copy(picture, QStringLiteral("copy"));
    for (int round = 0; round < 5; ++round) {
        const auto start = Clock::now();
        copy.copyFrom(picture);
        all.push_back(milliseconds(start));
    }
    std::sort(all.begin(), all.end());
    return all[all.size() / 2];
}

/// Takes reactions and reports them.
class Reactions {
public:
    explicit Reactions(benchmark::State& state) : mState(state) {}
    ~Reactions() {
        if (mAll.empty()) {
            mState.SkipWithError("nothing reacted");
            return;
        }
        std::sort(mAll.begin(), mAll.end());
        const double median = mAll[mAll.size() / 2];
        mState.counters["median"] = median;
        mState.counters["copies"] = median / copyMilliseconds(gBench->photo);
        mState.counters["most"] = mAll.back();
        mState.counters["reactions"] = static_cast<double>(mAll.size());
    }
    void add(double time) { mAll.push_back(time); }

private:
    benchmark::State& mState;
    std::vector<double> mAll;
};

void changeSettings() {
    CThinHorizontalSlider* slider =
        gBench->window.findChild<COrvelaSliderBlockImpl*>(QStringLiteral("sldrSaturation"))->sldrValue;
    slider->moveTo(slider->value() == 700 ? 800 : 700);
}

// Clicks on a button all through a run; each is answered when the view was painted with its effect.
void clickDuringRun(benchmark::State& state) {
    Reactions reactions(state);
    QToolButton* buttons[] = {&gBench->button("btnZoomIn"), &gBench->button("btnZoomOut")};
    PaintWatch paints(gBench->view().viewport());
    std::atomic<Clock::time_point> clicked;
    std::atomic<bool> waits = false;
    paints.onPainted = [&] {
        if (waits.exchange(false))
            reactions.add(milliseconds(clicked));
    };
    for (auto step : state) {
        changeSettings();
        std::jthread hand([&](const std::stop_token& stop) {
            for (std::size_t turn = 0; !stop.stop_requested(); ++turn) {
                std::this_thread::sleep_for(std::chrono::milliseconds(60 + 37 * (turn % 5)));
                if (waits)
                    continue;
                clicked = Clock::now();
                waits = true;
                Bench::postClick(*buttons[turn % 2]);
            }
        });
        const auto start = Clock::now();
        gBench->button("btnRefresh").click();
        state.SetIterationTime(milliseconds(start) / 1000);
    }
    Bench::wait(50); // clicks on their way
}
BENCHMARK(clickDuringRun)->UseManualTime()->Unit(benchmark::kMillisecond)->Iterations(3);

// From the click on Stop to the button that shows it; "end" is the median time to the end of the run, which
// the time of an iteration is, too.
void stop(benchmark::State& state) {
    Reactions reactions(state);
    std::vector<double> ends;
    QToolButton& button = gBench->button("btnStopProcessing");
    PaintWatch paints(&button);
    int turn = 0;
    for (auto step : state) {
        changeSettings();
        std::atomic<Clock::time_point> clicked = Clock::time_point();
        double shown = 0;
        paints.onPainted = [&] {
            if (clicked.load() != Clock::time_point() && !button.isEnabled() && shown == 0)
                shown = milliseconds(clicked);
        };
        std::jthread hand([&, delay = 60 + 40 * turn++] {
            std::this_thread::sleep_for(std::chrono::milliseconds(delay));
            clicked = Clock::now();
            Bench::postClick(button);
        });
        gBench->button("btnRefresh").click();
        const auto over = Clock::now();
        hand.join();
        paints.onPainted = {};
        QCoreApplication::processEvents(); // a click that came too late must not stop the next run
        const bool late = clicked.load() > over;
        state.SetIterationTime(late ? 0 : milliseconds(clicked, over) / 1000);
        if (late || shown == 0)
            continue;
        ends.push_back(milliseconds(clicked, over));
        reactions.add(shown);
    }
    std::sort(ends.begin(), ends.end());
    if (!ends.empty())
        state.counters["end"] = ends[ends.size() / 2];
}
BENCHMARK(stop)->UseManualTime()->Unit(benchmark::kMillisecond)->Iterations(15);

// A slider dragged to and fro: from each movement of the mouse to the draft that shows it.
void drag(benchmark::State& state, const char* name) {
    gBench->button("btnRefresh").click(); // whatever was stopped before
    Reactions reactions(state);
    auto* block = gBench->window.findChild<COrvelaSliderBlockImpl*>(QLatin1String(name));
    block->setEnabled(true);
    CThinHorizontalSlider* slider = block->sldrValue;
    PaintWatch paints(gBench->view().viewport());
    const auto send = [slider](QEvent::Type type, double x) {
        const QPointF at(x, slider->height() / 2.0);
        QMouseEvent event(type, at, slider->mapToGlobal(at), Qt::LeftButton, Qt::LeftButton, Qt::NoModifier);
        QCoreApplication::sendEvent(slider, &event);
    };
    send(QEvent::MouseButtonPress, slider->width() * 0.3);
    Bench::wait(1000);
    int turn = 0;
    for (auto step : state) {
        const auto moved = Clock::now();
        send(QEvent::MouseMove, slider->width() * (0.35 + 0.05 * (++turn % 10)));
        const double elapsed = milliseconds(moved, paints.await());
        reactions.add(elapsed);
        state.SetIterationTime(elapsed / 1000);
    }
    send(QEvent::MouseButtonRelease, slider->width() * 0.3);
    Bench::wait(300);
}
BENCHMARK_CAPTURE(drag, Saturation, "sldrSaturation")
    ->UseManualTime()
    ->Unit(benchmark::kMillisecond)
    ->Iterations(20);
BENCHMARK_CAPTURE(drag, SharpnessI, "sldrOrvela1")
    ->UseManualTime()
    ->Unit(benchmark::kMillisecond)
    ->Iterations(20);
BENCHMARK_CAPTURE(drag, SmartBlur, "sldrOrvela3")
    ->UseManualTime()
    ->Unit(benchmark::kMillisecond)
    ->Iterations(20);
BENCHMARK_CAPTURE(drag, Illumination, "sldrIllumination")
    ->UseManualTime()
    ->Unit(benchmark::kMillisecond)
    ->Iterations(20);

// The steps of the zoom table above the fitting one that the picture is scrolled at.
void scroll(benchmark::State& state) {
    Reactions reactions(state);
    CSignaledGraphicsView& view = gBench->view();
    PaintWatch paints(view.viewport());
    for (int step = 0; step < state.range(0); ++step)
        gBench->button("btnZoomIn").click();
    paints.await();
    QScrollBar* bar = view.horizontalScrollBar();
    for (auto step : state) {
        const auto moved = Clock::now();
        bar->setValue(bar->value() + 16 < bar->maximum() ? bar->value() + 16 : 0);
        const double elapsed = milliseconds(moved, paints.await());
        reactions.add(elapsed);
        state.SetIterationTime(elapsed / 1000);
    }
    for (int step = 0; step < state.range(0); ++step)
        gBench->button("btnZoomOut").click();
    Bench::wait(50);
}
BENCHMARK(scroll)->UseManualTime()->Unit(benchmark::kMillisecond)->Arg(4)->Arg(8)->Arg(12)->Iterations(60);

void zoom(benchmark::State& state) {
    Reactions reactions(state);
    PaintWatch paints(gBench->view().viewport());
    int turn = 0;
    for (auto step : state) {
        const auto clicked = Clock::now();
        gBench->button(turn++ / 6 % 2 == 0 ? "btnZoomIn" : "btnZoomOut").click();
        const double elapsed = milliseconds(clicked, paints.await());
        reactions.add(elapsed);
        state.SetIterationTime(elapsed / 1000);
    }
}
BENCHMARK(zoom)->UseManualTime()->Unit(benchmark::kMillisecond)->Iterations(24);

void fill(CARGBPlane& plane) {
    plane.setColorMode(CARGBPlane::Color);
    const QImage photo = QImage(QStringLiteral(ORVELA_SAMPLES "/coffee.png"))
                             .scaled(kPhoto, Qt::IgnoreAspectRatio, Qt::SmoothTransformation)
                             .convertToFormat(QImage::Format_RGB32);
    for (int y = 0; y < plane.height(); ++y) {
        const auto* line = reinterpret_cast<const QRgb*>(photo.constScanLine(y));
        for (int x = 0; x < plane.width(); ++x) {
            plane.row(y)[0][x] = static_cast<std::uint8_t>(qRed(line[x]));
            plane.row(y)[1][x] = static_cast<std::uint8_t>(qGreen(line[x]));
            plane.row(y)[2][x] = static_cast<std::uint8_t>(qBlue(line[x]));
        }
    }
}

} // namespace

int main(int argc, char** argv) {
    const QTemporaryDir folder; // nobody's own settings are touched
    qputenv("XDG_CONFIG_HOME", folder.path().toLocal8Bit());
    if (!qEnvironmentVariableIsSet("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    const QApplication application(argc, argv);
    QPointingDevice::primaryPointingDevice(); // made on this thread, for clicks that come from others
    setSettingsApplication(QStringLiteral("OrvelaWindowBench"));
    benchmark::Initialize(&argc, argv);
    CARGBPlane input(kPhoto.width(), kPhoto.height(), QStringLiteral("input"));
    fill(input);
    CARGBPlane output(input, QStringLiteral("output"));
    const CARGBPlaneProxyDirect proxy(input);
    Bench bench(&input, &output, proxy.plane());
    gBench = &bench;
    bench.run([] { benchmark::RunSpecifiedBenchmarks(); });
    return 0;
}
