// A processing window that is closed, in whichever state, leaves nothing behind.

#include "GUI/Controls/CThinHorizontalSlider.h"
#include "gui/Windows/RunsFixture.h"

#include <QContextMenuEvent>
#include <QDir>

using namespace orvela;

namespace {

qsizetype threads() {
    return QDir(QStringLiteral("/proc/self/task")).entryList(QDir::Dirs | QDir::NoDotAndDotDot).size();
}

struct State {
    const char* name;
    EGUIMode mode;
    std::function<void(ProcessingWindow&)> lead; ///< leads there
    bool popup = false;                          ///< something is open then
};

void atAStep(ProcessingWindow& opened, const std::function<void()>& user) {
    QObject::connect(opened.core(), &CThreadedCore::stepDone, &opened.window, [user](int step) {
        if (step == 3)
            user();
    });
    opened.click("btnRefresh");
}

void moveSlider(ProcessingWindow& opened) {
    auto* block = opened.window.findChild<COrvelaSliderBlockImpl*>();
    block->setEnabled(true);
    block->sldrValue->moveTo(block->value() + 50);
}

void close(ProcessingWindow& opened) {
    opened.window.close();
    EXPECT_FALSE(opened.window.isVisible()) << "at once";
}

const State kStates[] = {
    {"the result of a run is to be applied", Mode_Advanced,
     [](auto& opened) {
         atAStep(opened, [&] {
             opened.click("btnOK");
             close(opened);
         });
     }},
    {"another run is to come", Mode_Advanced,
     [](auto& opened) {
         atAStep(opened, [&] { opened.window.on_btnRefresh_clicked(); });
         close(opened);
     }},
    {"a refresh is to come by itself", Mode_Adjustments,
     [](auto& opened) {
         opened.click("chkBxAutoRefresh");
         moveSlider(opened);
         EXPECT_TRUE(opened.refreshTimer()->isActive());
         close(opened);
     }},
    {"a draft is being made", Mode_Advanced,
     [](auto& opened) {
         moveSlider(opened);
         QCoreApplication::processEvents(); // it has begun
         close(opened);
     }},
    {"the list of presets is open", Mode_Advanced, [](auto& opened) { opened.presets()->showPopup(); }, true},
    {"the menu of undo is open", Mode_Adjustments,
     [](auto& opened) {
         auto* pane = opened.window.template findChild<IWgtPane*>();
         QContextMenuEvent asked(QContextMenuEvent::Keyboard, QPoint(5, 5), pane->mapToGlobal(QPoint(5, 5)));
         QApplication::sendEvent(pane, &asked);
     },
     true},
};

TEST(ClosedWindow, LeavesNothingWhateverItWasIn) {
    { // threads and windows that are made once
        ProcessingWindow first(Mode_Advanced, testplanes::noise(72, 48));
        first.run([&] { first.click("btnOK"); });
    }
    for (const State& state : kStates) {
        SCOPED_TRACE(state.name);
        const qsizetype windows = QApplication::topLevelWidgets().size();
        const qsizetype before = threads();
        {
            ProcessingWindow opened(state.mode, testplanes::noise(72, 48));
            QTimer later;
            later.setSingleShot(true);
            QObject::connect(&later, &QTimer::timeout, &opened.window, [&] {
                EXPECT_TRUE(QApplication::activePopupWidget());
                close(opened);
            });
            opened.run([&] {
                if (state.popup)
                    later.start(20);
                state.lead(opened);
            });
            EXPECT_FALSE(opened.window.isVisible() || opened.window.appliesOnFinish());
            EXPECT_FALSE(QApplication::activePopupWidget());
            for (const QTimer* timer : opened.window.findChildren<QTimer*>())
                EXPECT_FALSE(timer->isActive()) << qPrintable(timer->objectName()) << timer->interval();
        }
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        EXPECT_EQ(QApplication::topLevelWidgets().size(), windows);
        EXPECT_TRUE(QTest::qWaitFor([&] { return threads() == before; })) << threads() << " of " << before;
    }
}

} // namespace
