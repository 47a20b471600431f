// The keys that the manual lists, each pressed in every window of the processing window and its previews.

#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Controls/CThinHorizontalSlider.h"
#include "GUI/Preview/CSignaledGraphicsView.h"
#include "GUI/Preview/CompareCurtain.h"
#include "gui/Windows/ProcessingWindow.h"
#include "support/ModalDialog.h"

#include <QCheckBox>
#include <QFile>
#include <QLabel>
#include <QMessageBox>
#include <QRegularExpression>
#include <QSet>

#include <gtest/gtest.h>

#include <map>

using namespace orvela;

namespace {

/// The keys of the manual's table, "Ctrl + plus" as "Ctrl++".
QStringList keysOfManual() {
    QFile file(QStringLiteral(ORVELA_SOURCES "/../docs/manual/welcome.md"));
    EXPECT_TRUE(file.open(QIODevice::ReadOnly));
    const QString text = QString::fromUtf8(file.readAll()).section(QStringLiteral("| keys |"), 1);
    QStringList found;
    for (const QString& line : text.split('\n').mid(2)) {
        if (!line.startsWith('|'))
            break;
        for (QString key : line.section('|', 1, 1).split(QStringLiteral(", "))) {
            key = key.remove(' ').replace(QLatin1String("plus"), QLatin1String("+"));
            key.replace(QLatin1String("minus"), QLatin1String("-"));
            if (!key.startsWith(QLatin1String("helddown")))
                found += key;
        }
    }
    return found;
}

/// A processing window in which keys are pressed, in the window that `place` names.
class Keyboard {
public:
    explicit Keyboard(const QString& place) : mPlace(place) {
        opened.window.setHelp([this](const QString& topic) { topics += topic; });
    }

    void press(const char* keys) { QTest::keySequence(target(), QKeySequence(QLatin1String(keys))); }
    void hold(Qt::Key key) { QTest::keyPress(target(), key); }
    void release(Qt::Key key) { QTest::keyRelease(target(), key); }

    QWidget* target() {
        if (mPlace == "sliders")
            return opened.find<COrvelaSliderBlockImpl>("sldrSaturation")->sldrValue;
        if (mPlace == "number")
            return opened.find<COrvelaSliderBlockImpl>("sldrSaturation")->txtValue;
        return views()[mPlace == "original" ? 0 : 1];
    }

    void activate() {
        target()->window()->activateWindow();
        target()->setFocus();
        ASSERT_TRUE(QTest::qWaitForWindowActive(target()->window()));
    }

    QList<CSignaledGraphicsView*> views() { return opened.window.findChildren<CSignaledGraphicsView*>(); }
    double scale() { return views()[1]->transform().m11(); }
    QList<CompareCurtain*> curtains() {
        QList<CompareCurtain*> found;
        for (QGraphicsItem* item : views()[1]->scene()->items())
            if (auto* curtain = dynamic_cast<CompareCurtain*>(item))
                found += curtain;
        return found;
    }
    bool shows(const char* name) { return opened.find(name) && opened.find(name)->isVisible(); }
    int slidersOn() {
        int on = 0;
        for (const auto* block : opened.window.findChildren<COrvelaSliderBlockImpl*>())
            on += block->isEnabled();
        return on;
    }

    ProcessingWindow opened{Mode_Advanced, testplanes::noise(96, 64)};
    QStringList topics;

private:
    QString mPlace;
};

void pressesRefresh(Keyboard& user) {
    int runs = 0;
    const auto counted = QObject::connect(user.opened.core(), &CThreadedCore::started, [&runs] { ++runs; });
    user.press("F5");
    EXPECT_EQ(runs, 1);
    QObject::disconnect(counted);
}

void zooms(Keyboard& user, const char* keys, double factor) {
    user.press("Ctrl+0");
    const double before = user.scale();
    user.press(keys);
    EXPECT_NEAR(user.scale(), before * factor, 1e-6);
}

void pressesStop(Keyboard& user) {
    user.opened.click("btnTurnAllOn"); // so that the result is not up to date
    CThreadedCore* core = user.opened.core();
    const auto stops = QObject::connect(core, &CThreadedCore::stepDone, &user.opened.window,
                                        [&](int step) { step == 3 ? user.press("Ctrl+.") : void(); });
    user.opened.click("btnRefresh");
    QObject::disconnect(stops);
    EXPECT_TRUE(std::any_of(core->reports().begin(), core->reports().end(), [](const TaskReport& report) {
        return report.outcome == TaskOutcome::Cancelled;
    }));
}

void pressesUndoAndRedo(Keyboard& user, const char* redo) {
    auto* block = user.opened.find<COrvelaSliderBlockImpl>("sldrDigitalFlash");
    block->setEnabled(!block->isEnabled());
    const bool now = block->isEnabled();
    user.press("Ctrl+Z");
    EXPECT_NE(block->isEnabled(), now);
    user.press(redo);
    EXPECT_EQ(block->isEnabled(), now);
}

// The box of a preset's button, which is not answered.
void opensBox(Keyboard& user, const char* key, const char* says) {
    QString seen;
    const ModalDialogs answers([&](QDialog& dialog) {
        if (&dialog == &user.opened.window)
            return;
        const auto* box = qobject_cast<QMessageBox*>(&dialog);
        seen += box ? box->text() : dialog.windowTitle();
        dialog.reject();
    });
    user.press(key);
    EXPECT_TRUE(seen.contains(QLatin1String(says))) << qPrintable(seen);
    user.activate();
}

void holdsToCompare(Keyboard& user, Qt::Key key) {
    ASSERT_EQ(user.curtains().size(), 0);
    user.hold(key);
    EXPECT_EQ(user.curtains().size(), 1);
    user.release(key);
    EXPECT_EQ(user.curtains().size(), 0);
}

void toggles(Keyboard& user, const char* key, const std::function<bool()>& state) {
    for (int i = 0; i < 2; ++i) {
        const bool before = state();
        user.press(key);
        EXPECT_NE(state(), before);
    }
}

void movesLine(Keyboard& user, const char* key, double end) {
    user.press("F3");
    user.press(key);
    user.press(key);
    ASSERT_EQ(user.curtains().size(), 1);
    EXPECT_NEAR(user.curtains()[0]->share(), end, 1e-9);
    user.press("F3");
    user.press(key); // no line: nothing moves
}

void pressesFinalTouch(Keyboard& user) {
    user.opened.click("btnRefresh");
    user.press("F6");
    EXPECT_EQ(user.opened.window.windowTitle(), "Final Touch");
    EXPECT_TRUE(QTest::qWaitFor([&] { return user.shows("btnBack"); }, 5000));
    QTest::keySequence(&user.opened.window, QKeySequence(Qt::Key_F6)); // the sliders are others now
    EXPECT_EQ(user.opened.window.windowTitle(), "Advanced");
    EXPECT_TRUE(QTest::qWaitFor([&] { return user.shows("btnFinalTouch"); }));
}

/// What each key does, but those that close the window.
const std::map<QString, std::function<void(Keyboard&)>>& effects() {
    static const std::map<QString, std::function<void(Keyboard&)>> table = {
        {"F1",
         [](Keyboard& user) {
             user.press("F1");
             EXPECT_EQ(user.topics.join(' '), "advancedenhancementoptions.htm");
         }},
        {"F5", pressesRefresh},
        {"Shift+F5",
         [](Keyboard& user) {
             const auto* box = user.opened.find<QCheckBox>("chkBxAutoRefresh");
             toggles(user, "Shift+F5", [box] { return box->isChecked(); });
         }},
        {"Ctrl+.", pressesStop},
        {"Ctrl+Z", [](Keyboard& user) { pressesUndoAndRedo(user, "Ctrl+Shift+Z"); }},
        {"Ctrl+Shift+Z", [](Keyboard& user) { pressesUndoAndRedo(user, "Ctrl+Shift+Z"); }},
        {"Ctrl+Y", [](Keyboard& user) { pressesUndoAndRedo(user, "Ctrl+Y"); }},
        {"Ctrl++", [](Keyboard& user) { zooms(user, "Ctrl++", 1.5); }},
        {"Ctrl+=", [](Keyboard& user) { zooms(user, "Ctrl+=", 1.5); }},
        {"Ctrl+-", [](Keyboard& user) { zooms(user, "Ctrl+-", 0.667); }},
        {"Ctrl+0",
         [](Keyboard& user) {
             user.press("Ctrl++");
             user.press("Ctrl+0");
             EXPECT_NEAR(user.scale() * 96, user.views()[1]->width(), 1);
             EXPECT_EQ(user.opened.find<QLabel>("lblZoomLevel")->text(), "100%");
         }},
        {"Ctrl+1",
         [](Keyboard& user) {
             user.press("Ctrl+1");
             EXPECT_NEAR(user.scale() * user.opened.window.devicePixelRatioF(), 1, 1e-6);
         }},
        {"F2", [](Keyboard& user) { holdsToCompare(user, Qt::Key_F2); }},
        {"Space",
         [](Keyboard& user) {
             if (qobject_cast<QGraphicsView*>(user.target()))
                 holdsToCompare(user, Qt::Key_Space);
         }},
        {"F3", [](Keyboard& user) { toggles(user, "F3", [&] { return user.curtains().size() == 1; }); }},
        {"Alt+Left", [](Keyboard& user) { movesLine(user, "Alt+Left", 0.46); }},
        {"Alt+Right", [](Keyboard& user) { movesLine(user, "Alt+Right", 0.5); }}, // back
        {"F4",
         [](Keyboard& user) {
             user.press("F4");
             user.activate();
             EXPECT_NE(user.shows("btnSplitPreviews"), user.shows("btnGluePreviews"));
             EXPECT_EQ(user.shows("CDlgDualPreview"), user.shows("btnSplitPreviews"));
             EXPECT_EQ(user.shows("CDlgSinglePreview"), user.shows("btnGluePreviews"));
         }},
        {"F6", pressesFinalTouch},
        {"F7",
         [](Keyboard& user) { toggles(user, "F7", [&] { return user.shows("btnCollapseSettings"); }); }},
        {"Ctrl+E",
         [](Keyboard& user) {
             user.press("Ctrl+E");
             EXPECT_GT(user.slidersOn(), 20);
         }},
        {"Ctrl+Shift+E",
         [](Keyboard& user) {
             user.press("Ctrl+Shift+E");
             EXPECT_EQ(user.slidersOn(), 0);
         }},
        {"Ctrl+S", [](Keyboard& user) { opensBox(user, "Ctrl+S", "Save Preset"); }},
        {"Ctrl+R", [](Keyboard& user) { opensBox(user, "Ctrl+R", "By reverting the profile"); }},
        {"Ctrl+D", [](Keyboard& user) { opensBox(user, "Ctrl+D", "cannot be deleted"); }},
    };
    return table;
}

class Keys : public testing::TestWithParam<const char*> {};

TEST_P(Keys, OfTheManualDoWhatItSays) {
    QSet<QString> closing = {QStringLiteral("Esc"), QStringLiteral("Ctrl+Enter")};
    Keyboard user(GetParam());
    user.opened.run([&] {
        for (const QString& key : keysOfManual()) {
            SCOPED_TRACE(key.toStdString());
            if (closing.remove(key))
                continue;
            const auto effect = effects().find(key);
            ASSERT_NE(effect, effects().end()) << "the manual tells of a key that nothing here tries";
            user.activate();
            effect->second(user);
        }
        EXPECT_TRUE(closing.isEmpty());
        user.activate();
        user.press("Esc");
    });
    EXPECT_FALSE(user.opened.window.appliesOnFinish());

    Keyboard again(GetParam());
    again.opened.run([&] {
        again.activate();
        again.press("Ctrl+Enter");
    });
    EXPECT_TRUE(again.opened.window.appliesOnFinish());
}

INSTANTIATE_TEST_SUITE_P(Windows, Keys, testing::Values("sliders", "number", "original", "processed"));

// It would press the button of a dialog otherwise, which leads to Final Touch.
TEST(KeysOfWindow, EnterTakesTheNumberThatWasTyped) {
    ProcessingWindow opened(Mode_Advanced, testplanes::noise(96, 64));
    opened.run([&] {
        opened.click("btnRefresh");
        auto* block = opened.find<COrvelaSliderBlockImpl>("sldrSaturation");
        block->txtValue->setFocus();
        block->txtValue->selectAll();
        QTest::keyClicks(block->txtValue, QStringLiteral("7.5"));
        QTest::keyClick(block->txtValue, Qt::Key_Return);
        QTest::qWait(200); // a button pressed by a key is up again later
        EXPECT_EQ(block->value(), 750);
        EXPECT_EQ(opened.window.windowTitle(), "Advanced");
        EXPECT_TRUE(opened.window.isVisible());
        opened.click("btnCancel");
    });
}

// Whoever presses a key that the manual does not tell would not know it.
TEST(KeysOfWindow, AreAllToldByTheManual) {
    ProcessingWindow opened(Mode_Advanced, testplanes::noise(8, 8));
    const QStringList told = keysOfManual();
    opened.run([&] {
        for (const QAction* action : opened.window.actions())
            for (const QKeySequence& keys : action->shortcuts())
                EXPECT_TRUE(told.contains(keys.toString().replace("Return", "Enter")))
                    << qPrintable(keys.toString());
        opened.click("btnCancel");
    });
}

} // namespace
