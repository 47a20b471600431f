#include "GUI/Windows/CDlgSettingsImpl.h"

#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "gui/Windows/ProcessingWindow.h"

#include <QGraphicsView>

#include <QSet>
#include <gtest/gtest.h>
#include <random>

using namespace orvela;

namespace {

std::unique_ptr<CARGBPlane> picture() {
    return testplanes::make(96, 64, [](int x, int y) {
        return testplanes::Pixel{std::uint8_t(40 + x), std::uint8_t(30 + x + y), std::uint8_t(20 + 2 * y)};
    });
}

void grabAll(const char* tag) {
    const QByteArray folder = qgetenv("ORVELA_GRAB");
    if (folder.isEmpty())
        return;
    for (QWidget* window : QApplication::topLevelWidgets())
        if (window->isVisible())
            window->grab().save(QString::fromLocal8Bit(folder) + QLatin1Char('/') + QLatin1String(tag) + window->objectName() + window->windowTitle().left(9) + QStringLiteral(".png"));
}

TEST(CDlgSettingsImpl, AnAutomaticModeRunsByItselfAndAppliesTheEnginesResult) {
    ProcessingWindow opened(Mode_Automatic, picture());
    opened.run();
    EXPECT_TRUE(opened.window.appliesOnFinish());
    EXPECT_EQ(opened.window.result(), QDialog::Accepted);
    EXPECT_EQ(testplanes::bytes(opened.output), opened.engineResult(CUserParamsPhotoshop(Mode_Automatic)));
}

TEST(CDlgSettingsImpl, OkAfterARefreshAcceptsWithoutAnotherRun) {
    ProcessingWindow opened(Mode_Advanced, picture());
    opened.run([&] {
        grabAll("a-");
        opened.click("btnRefresh");
        grabAll("b-");
        opened.click("btnOK");
    });
    EXPECT_TRUE(opened.window.appliesOnFinish());
    EXPECT_EQ(opened.window.result(), QDialog::Accepted);
}

// Every few events something is clicked, moved, closed: whatever comes, no run starts inside another one, and
// what is applied is what the settings ask for.
class Monkey : public QObject {
public:
    Monkey(ProcessingWindow& opened, std::mt19937& random) : mOpened(opened), mRandom(random) {
        mTimer.setInterval(0);
        connect(&mTimer, &QTimer::timeout, this, &Monkey::act);
        mTimer.start();
    }

    int actions() const { return mActions; }

private:
    void act() {
        if (mRandom() % 3 != 0)
            return;
        ++mActions;
        if (mActions > 60)
            return mOpened.window.reject();
        watch();
        switch (mRandom() % 16) {
        case 0:
            return pick("btnOK");
        case 1:
            return pick("btnStopProcessing");
        case 2:
            return mRandom() % 4 == 0 ? pick("btnCancel") : void();
        case 3:
        case 4:
        case 5:
            return pick("btnRefresh");
        case 6:
            return pick("btnFinalTouch");
        case 7:
            return pick("btnBack");
        case 8:
            return mRandom() % 8 == 0 ? void(mOpened.window.close()) : void();
        case 9:
            return pick("chkBxAutoRefresh");
        case 10:
            return pick("btnSplitPreviews");
        case 11:
            return pick("btnGluePreviews");
        case 12:
            return mOpened.window.findChild<QTimer*>() ? void() : mOpened.window.on_btnRefresh_clicked();
        default:
            return moveSlider();
        }
    }

    void pick(const char* button) {
        auto* found = mOpened.window.findChild<QAbstractButton*>(QLatin1String(button));
        if (found && found->isVisible() && found->isEnabled())
            QTest::mouseClick(found, Qt::LeftButton);
    }

    void moveSlider() {
        const auto blocks = mOpened.window.findChildren<COrvelaSliderBlockImpl*>();
        COrvelaSliderBlockImpl* block = blocks[int(mRandom() % unsigned(blocks.size()))];
        if (!block->isVisible() || !static_cast<QWidget*>(block)->isEnabled())
            return;
        block->setEnabled(true);
        QTest::mouseClick(block, Qt::LeftButton, {},
                          QPoint(int(mRandom() % unsigned(block->width())), block->height() / 2));
    }

    void watch() {
        for (CThreadedCore* core : mOpened.window.findChildren<CThreadedCore*>()) {
            if (mWatched.contains(core))
                continue;
            mWatched.insert(core);
            connect(core, &CThreadedCore::started, this, [this] { EXPECT_EQ(++mRuns, 1); });
            connect(core, &CThreadedCore::finished, this, [this] { EXPECT_EQ(--mRuns, 0); });
        }
    }

    ProcessingWindow& mOpened;
    std::mt19937& mRandom;
    QTimer mTimer;
    QSet<CThreadedCore*> mWatched;
    int mActions = 0;
    int mRuns = 0;
};

TEST(CDlgSettingsImpl, SurvivesWhateverIsClickedWheneverItIs) {
    std::mt19937 random(20261123);
    int actions = 0;
    for (int i = 0; i < 40; ++i) {
        ProcessingWindow opened(i % 2 ? Mode_Advanced : Mode_Adjustments, picture());
        Monkey monkey(opened, random);
        opened.window.run();
        actions += monkey.actions();
        EXPECT_FALSE(opened.window.isVisible());
    }
    EXPECT_GT(actions, 1000);
}

} // namespace
