// The keys that the manual lists, each pressed in every window of the processing window and its previews.

#include "GUI/Controls/CThinHorizontalSlider.h"
#include "GUI/Preview/CompareCurtain.h"
#include "gui/Windows/ProcessingWindow.h"
#include "support/ModalDialog.h"

#include <QFile>
#include <QLabel>
#include <QSet>
#include <QSignalSpy>

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
    explicit Keyboard(const QString& place) : mPlace(place) {}

    void press(const QString& keys) { QTest::keySequence(target(), QKeySequence(keys)); }

    QWidget* target() {
        if (mPlace == "sliders")
            return opened.block()->sldrValue;
        if (mPlace == "number")
            return opened.block()->txtValue;
        return opened.views()[mPlace == "original" ? 0 : 1];
    }

    void activate() {
        QTest::qWait(1); // the picture of a window that was just shown finds its place
        target()->window()->activateWindow();
        target()->setFocus();
        ASSERT_TRUE(QTest::qWaitForWindowActive(target()->window()));
    }

    double scale() { return opened.views()[1]->transform().m11(); }
    QList<CompareCurtain*> curtains() {
        QList<CompareCurtain*> found;
        for (QGraphicsItem* item : opened.views()[1]->scene()->items())
            if (auto* curtain = dynamic_cast<CompareCurtain*>(item))
                found += curtain;
        return found;
    }

    ProcessingWindow opened{Mode_Advanced, testplanes::noise(96, 64)};

private:
    QString mPlace;
};

/// The buttons that keys press, one after the other. What they do is tried where they are clicked.
const std::map<QString, QList<const char*>>& buttons() {
    static const std::map<QString, QList<const char*>> table = {
        {"F1", {"btnHelp"}},
        {"F5", {"btnRefresh"}},
        {"Shift+F5", {"chkBxAutoRefresh", "chkBxAutoRefresh"}},
        {"Ctrl++", {"btnZoomIn"}},
        {"Ctrl+=", {"btnZoomIn"}},
        {"Ctrl+-", {"btnZoomOut"}},
        {"F4", {"btnSplitPreviews", "btnGluePreviews", "btnSplitPreviews"}},
        {"F7", {"btnExtendSettings", "btnCollapseSettings"}},
        {"Ctrl+E", {"btnTurnAllOn"}},
        {"Ctrl+Shift+E", {"btnTurnAllOff"}},
        {"Ctrl+S", {"btnSavePreset"}},
        {"Ctrl+R", {"btnRevertPreset"}},
        {"Ctrl+D", {"btnDeletePreset"}},
    };
    return table;
}

void pressesButton(Keyboard& user, const QString& key, const char* name) {
    auto* button = user.opened.find<QAbstractButton>(name);
    ASSERT_TRUE(button) << name;
    EXPECT_TRUE(QTest::qWaitFor([&] { return button->isVisible() && button->isEnabled(); })) << name;
    QSignalSpy clicked(button, &QAbstractButton::clicked);
    const ModalDialogs unanswered([&](QDialog& dialog) {
        if (&dialog != &user.opened.window)
            dialog.reject();
    });
    user.activate();
    user.press(key);
    EXPECT_EQ(clicked.count(), 1) << name;
}

void pressesStop(Keyboard& user, const QString& key) {
    user.opened.click("btnTurnAllOn"); // so that the result is not up to date
    QSignalSpy clicked(user.opened.find<QAbstractButton>("btnStopProcessing"), &QAbstractButton::clicked);
    QObject::connect(user.opened.core(), &CThreadedCore::stepDone, &clicked,
                     [&](int step) { step == 3 ? user.press(key) : void(); });
    user.opened.click("btnRefresh");
    EXPECT_EQ(clicked.count(), 1);
}

void undoesAndRedoes(Keyboard& user, const QString& redo) {
    COrvelaSliderBlockImpl* block = user.opened.block("sldrDigitalFlash");
    const bool before = block->isEnabled();
    block->setEnabled(!before);
    user.press(QStringLiteral("Ctrl+Z"));
    EXPECT_EQ(block->isEnabled(), before);
    user.press(redo);
    EXPECT_NE(block->isEnabled(), before);
}

void holdsToCompare(Keyboard& user, const QString& key) {
    if (key == "Space" && !qobject_cast<QGraphicsView*>(user.target()))
        return; // there it presses and types
    const Qt::Key held = QKeySequence(key)[0].key();
    QTest::keyPress(user.target(), held);
    EXPECT_EQ(user.curtains().size(), 1);
    QTest::keyRelease(user.target(), held);
    EXPECT_EQ(user.curtains().size(), 0);
}

void movesLine(Keyboard& user, const QString& key) {
    user.press(QStringLiteral("F3"));
    ASSERT_EQ(user.curtains().size(), 1);
    const double before = user.curtains()[0]->share();
    user.press(key);
    EXPECT_NEAR(user.curtains()[0]->share(), before + (key == "Alt+Left" ? -0.02 : 0.02), 1e-9);
    user.press(QStringLiteral("F3"));
    user.press(key); // no line: nothing moves
}

void leadsToFinalTouchAndBack(Keyboard& user, const QString& key) {
    user.opened.click("btnRefresh");
    user.press(key);
    EXPECT_EQ(user.opened.window.windowTitle(), "Final Touch");
    EXPECT_TRUE(QTest::qWaitFor([&] { return user.opened.find("btnBack")->isVisible(); }, 5000));
    QTest::keySequence(&user.opened.window, QKeySequence(key)); // the sliders are others now
    EXPECT_EQ(user.opened.window.windowTitle(), "Advanced");
    EXPECT_TRUE(QTest::qWaitFor([&] { return user.opened.find("btnFinalTouch")->isVisible(); }));
}

/// What the other keys do, but those that close the window.
const std::map<QString, void (*)(Keyboard&, const QString&)>& effects() {
    static const std::map<QString, void (*)(Keyboard&, const QString&)> table = {
        {"Ctrl+.", pressesStop},
        {"Ctrl+Z", [](Keyboard& user, const QString&) { undoesAndRedoes(user, "Ctrl+Shift+Z"); }},
        {"Ctrl+Shift+Z", undoesAndRedoes},
        {"Ctrl+Y", undoesAndRedoes},
        {"Ctrl+0",
         [](Keyboard& user, const QString& key) {
             user.press(QStringLiteral("Ctrl++"));
             user.press(key);
             EXPECT_NEAR(user.scale() * 96, user.opened.views()[1]->width(), 1);
             EXPECT_EQ(user.opened.find<QLabel>("lblZoomLevel")->text(), "100%");
         }},
        {"Ctrl+1",
         [](Keyboard& user, const QString& key) {
             user.press(key);
             EXPECT_NEAR(user.scale() * user.opened.window.devicePixelRatioF(), 1, 1e-6);
         }},
        {"F2", holdsToCompare},
        {"Space", holdsToCompare},
        {"F3",
         [](Keyboard& user, const QString& key) {
             for (const int lines : {1, 0}) {
                 user.press(key);
                 EXPECT_EQ(user.curtains().size(), lines);
             }
         }},
        {"Alt+Left", movesLine},
        {"Alt+Right", movesLine},
        {"F6", leadsToFinalTouchAndBack},
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
            user.activate();
            if (const auto pressed = buttons().find(key); pressed != buttons().end()) {
                for (const char* name : pressed->second)
                    pressesButton(user, key, name);
                continue;
            }
            const auto effect = effects().find(key);
            ASSERT_NE(effect, effects().end()) << "the manual tells of a key that nothing here tries";
            effect->second(user, key);
        }
        EXPECT_TRUE(closing.isEmpty());
        user.activate();
        user.press(QStringLiteral("Esc"));
    });
    EXPECT_FALSE(user.opened.window.appliesOnFinish());

    Keyboard again(GetParam());
    again.opened.run([&] {
        again.activate();
        again.press(QStringLiteral("Ctrl+Enter"));
    });
    EXPECT_TRUE(again.opened.window.appliesOnFinish());
}

INSTANTIATE_TEST_SUITE_P(Windows, Keys, testing::Values("sliders", "number", "original", "processed"));

// It would press the button of a dialog otherwise, which leads to Final Touch.
TEST(KeysOfWindow, EnterTakesTheNumberThatWasTyped) {
    ProcessingWindow opened(Mode_Advanced, testplanes::noise(96, 64));
    opened.run([&] {
        opened.click("btnRefresh");
        QLineEdit* field = opened.block()->txtValue;
        field->setFocus();
        field->selectAll();
        QTest::keyClicks(field, QStringLiteral("7.5"));
        QTest::keyClick(field, Qt::Key_Return);
        QTest::qWait(200); // a button pressed by a key is up again later
        EXPECT_EQ(opened.block()->value(), 750);
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
