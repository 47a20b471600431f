// A user who clicks, types, drags, drops files, changes the mode and closes the window at random moments of
// real runs, and time that passes between.

#include "Core/CThreadedCore_FinalTouch.h"
#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Controls/CThinHorizontalSlider.h"
#include "GUI/Panes/IWgtPane.h"
#include "GUI/Preview/CSignaledGraphicsView.h"
#include "Settings/SettingsStore.h"
#include "gui/Windows/ProcessingWindow.h"
#include "support/ModalDialog.h"

#include <QComboBox>
#include <QFile>
#include <QMessageBox>
#include <QPainter>
#include <QSet>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <random>

using namespace orvela;

namespace {

constexpr int kActionsOfAWindow = 50;
constexpr EGUIMode kModes[] = {Mode_Advanced, Mode_FinalTouch,      Mode_Adjustments, Mode_SmartLevels,
                               Mode_Advanced, Mode_AddIllumination, Mode_Temperature, Mode_ColorFilter};

/// Acts whenever the window serves events, in the middle of a run or not.
class RandomUser : public QObject {
public:
    /// @param alone  there is no dialogue, and a run is under way when the window first serves events
    /// @param files  that may be dropped: three
    RandomUser(ProcessingWindow& opened, bool alone, std::mt19937& random, const QStringList& files)
        : mOpened(opened), mRandom(random), mFiles(files), mRuns(alone) {
        waitForMore();
    }

    int actions() const { return mActions; }
    int actionsInRuns() const { return mActionsInRuns; }
    /// What was done, in short.
    const std::string& trail() const { return mTrail; }

private:
    unsigned upTo(unsigned last) { return mRandom() % (last + 1); }

    // A timer of its own each time: one whose slot starts a run would not run out in it. Not an event that is
    // posted: those come before all others, and the loop of a closed window would not end.
    void waitForMore() {
        auto* timer = new QTimer(this);
        timer->setSingleShot(true);
        connect(timer, &QTimer::timeout, this, [this, timer] {
            timer->deleteLater();
            act();
        });
        timer->start(0);
    }

    void act() {
        if (mActions > 0 && !mOpened.window.isVisible())
            return;
        waitForMore();
        if (upTo(2) != 0)
            return; // for a while nothing
        const QWidget* box = QApplication::activeModalWidget();
        if (QApplication::activePopupWidget() || (box && box != &mOpened.window))
            return mOpened.letTheSecondPass(); // all else waits
        watch();
        mActionsInRuns += mRuns;
        if (++mActions > kActionsOfAWindow)
            return mActions % 2 == 0 ? click("btnOK") : void();
        doSomething();
        watch();
        EXPECT_LE(mRuns, 1);
    }

    void doSomething() {
        const auto undo = [this] { press(Qt::Key_Z, Qt::ControlModifier); };
        const auto refresh = [this] { click("btnRefresh"); };
        const auto passTime = [this] { mOpened.letTheSecondPass(); };
        const auto slide = [this] { moveSlider(); };
        const std::function<void()> deeds[] = {
            [this] { click("btnOK"); },
            [this] { click("btnStopProcessing"); },
            [this] { upTo(9) == 0 ? click("btnCancel") : void(); },
            [this] { upTo(9) == 0 ? void(mOpened.window.close()) : void(); },
            refresh,
            refresh,
            passTime,
            passTime,
            [this] { click(upTo(1) ? "btnFinalTouch" : "btnBack"); },
            [this] { changeMode(); },
            [this] { click("chkBxAutoRefresh"); },
            [this] { click(upTo(1) ? "btnSplitPreviews" : "btnGluePreviews"); },
            [this] { click(upTo(1) ? "btnTurnAllOn" : "btnTurnAllOff"); },
            [this] { choosePreset(); },
            undo,
            undo,
            [this] { press(Qt::Key_Y, Qt::ControlModifier); },
            [this] { press(Qt::Key(Qt::Key_F1 + upTo(6))); },
            [this] { drop(&mOpened.window, {QUrl::fromLocalFile(mFiles[upTo(2)])}); },
            [this] { openPopup(); },
            slide,
            slide,
            slide,
        };
        const unsigned what = upTo(std::size(deeds) - 1);
        mTrail += std::to_string(what) + (mRuns ? "r " : " ");
        deeds[what]();
    }

    void changeMode() {
        if (mOpened.find("frmBottomContainer")->isVisible() && upTo(3) == 0)
            mOpened.window.changeMode(kModes[upTo(std::size(kModes) - 1)]);
    }

    void click(const char* button) {
        auto* found = mOpened.find<QAbstractButton>(button);
        if (found && found->isVisible() && found->isEnabled())
            QTest::mouseClick(found, Qt::LeftButton);
    }

    void press(Qt::Key key, Qt::KeyboardModifiers modifiers = {}) {
        if (mOpened.window.isVisible())
            QTest::keyClick(&mOpened.window, key, modifiers);
    }

    // Left open for a while, in which it takes the keys.
    void openPopup() {
        auto* presets = mOpened.find<QComboBox>("lstBxPreset");
        if (!presets->isVisible() || !presets->isEnabled())
            return;
        presets->showPopup();
        QTimer::singleShot(int(upTo(2)), this, [] {
            if (QWidget* popup = QApplication::activePopupWidget())
                QTest::keyClick(popup, Qt::Key_Escape);
        });
    }

    void choosePreset() {
        auto* presets = mOpened.find<QComboBox>("lstBxPreset");
        if (presets->isVisible() && presets->count() > 0)
            presets->setCurrentIndex(static_cast<int>(upTo(static_cast<unsigned>(presets->count() - 1))));
        if (upTo(1) == 0)
            mOpened.letTheSecondPass(); // of a change within a run, too
    }

    void moveSlider() {
        const auto blocks = mOpened.window.findChildren<COrvelaSliderBlockImpl*>();
        COrvelaSliderBlockImpl* block = blocks[upTo(static_cast<unsigned>(blocks.size() - 1))];
        if (!block->isVisible() || !static_cast<QWidget*>(block)->isEnabled())
            return;
        if (upTo(3) == 0)
            return QTest::mouseDClick(block, Qt::LeftButton, {}, QPoint(5, block->height() / 2));
        block->setEnabled(true);
        const auto right = static_cast<unsigned>(block->width() - 1);
        QTest::mouseClick(block, Qt::LeftButton, {},
                          QPoint(static_cast<int>(upTo(right)), block->height() / 2));
        if (upTo(1) == 0)
            QTest::keyClick(block->sldrValue, Qt::Key_Left);
    }

    // No run begins before the one that is under way has returned, on whichever core.
    void watch() {
        for (CThreadedCore* core : mOpened.window.findChildren<CThreadedCore*>()) {
            if (mWatched.contains(core))
                continue;
            mWatched.insert(core);
            connect(core, &CThreadedCore::started, this, [this] {
                mTrail += "< ";
                EXPECT_EQ(++mRuns, 1);
            });
            connect(core, &CThreadedCore::finished, this, [this] {
                mTrail += "> ";
                EXPECT_EQ(--mRuns, 0);
            });
            connect(core, &QObject::destroyed, this, [this, core] {
                EXPECT_EQ(mRuns, 0) << "a core went in the middle of a run";
                mWatched.remove(core);
            });
        }
    }

    ProcessingWindow& mOpened;
    std::mt19937& mRandom;
    QStringList mFiles;
    QSet<CThreadedCore*> mWatched;
    std::string mTrail;
    int mActions = 0;
    int mActionsInRuns = 0;
    int mRuns;
};

// What the left preview shows, if there is one: the picture that the mode started from.
std::unique_ptr<CARGBPlane> startOf(ProcessingWindow& opened) {
    if (opened.window.findChildren<CSignaledGraphicsView*>().isEmpty())
        return std::make_unique<CARGBPlane>(opened.proxy.plane(), QStringLiteral("start"));
    QImage image(opened.output.width(), opened.output.height(), QImage::Format_RGB32);
    QPainter painter(&image);
    opened.window.findChildren<CSignaledGraphicsView*>().first()->scene()->render(&painter);
    return testplanes::make(image.width(), image.height(), [&image](int x, int y) {
        const QRgb pixel = image.pixel(x, y);
        return testplanes::Pixel{std::uint8_t(qRed(pixel)), std::uint8_t(qGreen(pixel)),
                                 std::uint8_t(qBlue(pixel))};
    });
}

// What the engine makes by itself of that with the settings of the pane.
std::vector<std::uint8_t> expected(ProcessingWindow& opened) {
    auto* pane = opened.window.findChildren<IWgtPane*>().last();
    CUserParamsPhotoshop params(pane->mode());
    pane->applyGUIParams(params);
    const auto start = startOf(opened);
    if (pane->mode() == Mode_FinalTouch)
        return engineResult<CThreadedCore_FinalTouch>(params, *start, opened.proxy);
    return engineResult(params, *start, opened.proxy);
}

QStringList filesIn(const QTemporaryDir& folder) {
    QStringList paths;
    for (const char* content :
         {R"({"version": 1, "settings": {"SaturationEnabled": true}})",
          R"({"version": 1, "settings": {"DigitalFlashEnabled": true}})", "a picture"}) {
        paths += folder.filePath(QString::number(paths.size()));
        QFile file(paths.last());
        EXPECT_TRUE(file.open(QIODevice::WriteOnly) && file.write(content) > 0);
    }
    return paths;
}

void letLoose(std::uint32_t seed, int actionsWanted) {
    const QTemporaryDir folder;
    const QStringList files = filesIn(folder);
    std::mt19937 random(seed);
    int actions = 0;
    int inRuns = 0;
    int accepted = 0;
    int windows = 0;
    const ModalDialogs boxes([](QDialog& dialog) {
        if (auto* refused = qobject_cast<QMessageBox*>(&dialog)) // a file that was dropped
            return refused->accept();
        EXPECT_TRUE(qobject_cast<CDlgSettingsImpl*>(&dialog)) << qPrintable(dialog.windowTitle());
    });
    for (; actions < actionsWanted && !testing::Test::HasFailure(); ++windows) {
        SCOPED_TRACE(testing::Message() << "window " << windows);
        const qsizetype before = QApplication::topLevelWidgets().size();
        {
            const bool alone = random() % 5 == 0; // without a dialogue
            ProcessingWindow opened(alone ? Mode_AutomaticPro : kModes[random() % std::size(kModes)],
                                    testplanes::noise(24, 16, random()));
            RandomUser user(opened, alone, random, files);
            opened.window.run();
            actions += user.actions();
            inRuns += user.actionsInRuns();
            EXPECT_TRUE(alone || !opened.window.isVisible());
            EXPECT_EQ(opened.window.appliesOnFinish(), opened.window.result() == QDialog::Accepted);
            if (opened.window.appliesOnFinish()) {
                ++accepted;
                EXPECT_EQ(testplanes::bytes(opened.output), expected(opened))
                    << opened.window.windowTitle().toStdString() << " after " << user.trail();
            }
        }
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        EXPECT_EQ(QApplication::topLevelWidgets().size(), before) << "a window was left";
    }
    EXPECT_GT(inRuns, actions / 5) << "the user is to come in the middle of runs";
    EXPECT_GT(accepted, windows / 10);
}

TEST(RandomUser, NeverMakesTwoRunsMeetNorAppliesWhatWasNotAskedFor) {
    letLoose(20261123, 300);
}

TEST(RandomUser, NeverDoesForThousandsOfActions) {
    for (const std::uint32_t seed : {1U, 2U, 3U, 4U})
        letLoose(seed, 1000);
}

} // namespace
