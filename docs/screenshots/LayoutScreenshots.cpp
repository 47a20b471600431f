#include "LayoutScreenshots.h"

#include "Core/CThreadedCore.h"
#include "GUI/Panes/CWgtPaneAdvancedImpl.h"
#include "GUI/Windows/CDlgMainImpl.h"
#include "GUI/Windows/CDlgSettingsImpl.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Settings/ModeTable.h"
#include "Settings/SettingsStore.h"

#include <QAbstractButton>
#include <QApplication>
#include <QComboBox>
#include <QDebug>
#include <QElapsedTimer>
#include <QMenu>
#include <QScreen>
#include <QTabWidget>
#include <QTimer>
#include <QWindow>

using namespace orvela;

namespace {

constexpr int kSettling = 400; // milliseconds: for the window manager and the previews
constexpr int kMargin = 12;

void settle(int milliseconds = kSettling) {
    QElapsedTimer time;
    for (time.start(); !time.hasExpired(milliseconds);)
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents | QEventLoop::AllEvents, 20);
}

/// A photograph, and the windows that open over it, which are taken as they stand on the screen.
class Layouts {
public:
    Layouts(const QImage& photo, QString folder, QString suffix)
        : mInput(photo.width(), photo.height(), QStringLiteral("photo")), mOutput(fill(photo)),
          mProxy(mInput), mFolder(std::move(folder)), mSuffix(std::move(suffix)) {
        mDesk.setWindowFlags(Qt::FramelessWindowHint | Qt::WindowStaysOnBottomHint);
        mDesk.setPalette(QColor(92, 104, 116));
        mDesk.setGeometry(QApplication::primaryScreen()->geometry());
        mDesk.show();
        settle();
    }

    bool takeAll() {
        takeMainWindow();
        takeRuns();
        takeAdvanced();
        takeFinalTouch();
        takeOthers();
        return mSaved;
    }

private:
    CARGBPlane fill(const QImage& photo);
    void take(const QString& name);
    void drive(EGUIMode mode, const std::function<void(CDlgSettingsImpl&)>& user);
    void takeAtStep(CDlgSettingsImpl& window, const QString& name);
    void click(QWidget& window, const char* button);
    void takeMainWindow();
    void takeRuns();
    void takeAdvanced();
    void takeFinalTouch();
    void takeOthers();

    CARGBPlane mInput;
    CARGBPlane mOutput;
    CARGBPlaneProxyDirect mProxy;
    QString mFolder;
    QString mSuffix;
    QWidget mDesk;
    bool mSaved = true;
};

CARGBPlane Layouts::fill(const QImage& photo) {
    mInput.setColorMode(CARGBPlane::Color);
    for (int y = 0; y < photo.height(); ++y)
        for (int x = 0; x < photo.width(); ++x) {
            const QColor color = photo.pixelColor(x, y);
            mInput.row(y)[0][x] = static_cast<std::uint8_t>(color.red());
            mInput.row(y)[1][x] = static_cast<std::uint8_t>(color.green());
            mInput.row(y)[2][x] = static_cast<std::uint8_t>(color.blue());
        }
    return {mInput, QStringLiteral("output")};
}

// The part of the screen that the windows take up.
void Layouts::take(const QString& name) {
    settle();
    QRect area;
    for (const QWidget* window : QApplication::topLevelWidgets())
        if (window != &mDesk && window->isVisible())
            area |= window->frameGeometry();
    area = area.adjusted(-kMargin, -kMargin, kMargin, kMargin) & mDesk.geometry();
    const QString path = QStringLiteral("%1/%2-%3.png").arg(mFolder, name, mSuffix);
    const QPixmap picture =
        QApplication::primaryScreen()->grabWindow(0, area.x(), area.y(), area.width(), area.height());
    mSaved = picture.save(path) && mSaved;
}

void Layouts::click(QWidget& window, const char* button) {
    window.findChild<QAbstractButton*>(QLatin1String(button))->click();
    settle();
}

// In the middle of the next run, or of the one under way.
void Layouts::takeAtStep(CDlgSettingsImpl& window, const QString& name) {
    constexpr int kStep = 12;
    QObject::connect(window.findChild<CThreadedCore*>(), &CThreadedCore::stepDone, &window,
                     [this, name, taken = false](int step) mutable {
                         if (step >= kStep && !std::exchange(taken, true))
                             take(name);
                     });
}

void Layouts::drive(EGUIMode mode, const std::function<void(CDlgSettingsImpl&)>& user) {
    mInput.copyFrom(mProxy.plane());
    mOutput.copyFrom(mProxy.plane());
    openSettings().remove(QStringLiteral("2000/GUI"));
    openSettings().setValue(QStringLiteral("2000/GUI/CDlgSettingsImpl/pos"), QPoint(40, 60));
    CDlgSettingsImpl window(mode, &mInput, &mOutput);
    QTimer::singleShot(0, &window, [&] {
        settle();
        user(window);
        window.reject();
    });
    window.run();
}

void Layouts::takeMainWindow() {
    openSettings().setValue(QStringLiteral("2000/GUI/CDlgMainImpl/pos"), QPoint(60, 60));
    CDlgMainImpl window(nullptr, &mInput, &mOutput);
    QTimer::singleShot(0, &window, [&] {
        take(QStringLiteral("main-collapsed"));
        click(window, "btnExpand");
        take(QStringLiteral("main-expanded"));
        QCursor::setPos(window.geometry().topRight() + QPoint(12, 200));
        click(window, "btnIndivFilters");
        take(QStringLiteral("main-filters"));
        window.findChild<QMenu*>()->close();
        click(window, "btnHelp");
        take(QStringLiteral("help"));
        window.close();
    });
    window.run();
    openSettings().setValue(QStringLiteral("UpdateAvailable"), 2.5);
    CDlgMainImpl later(nullptr, &mInput, &mOutput);
    QTimer::singleShot(0, &later, [&] {
        take(QStringLiteral("main-update"));
        later.close();
    });
    later.run();
    openSettings().remove(QStringLiteral("UpdateAvailable"));
}

// The window of every way of working without a dialogue, in the middle of its run.
void Layouts::takeRuns() {
    for (const ModeDescription& mode : ModeTable::all()) {
        if (!mode.presetName)
            continue;
        mInput.copyFrom(mProxy.plane());
        mOutput.copyFrom(mProxy.plane());
        openSettings().setValue(QStringLiteral("2000/GUI/CDlgSettingsImpl/pos"), QPoint(40, 60));
        CDlgSettingsImpl window(mode.mode, &mInput, &mOutput);
        const QString name = QStringLiteral("run-") + QString::fromLatin1(mode.presetName).toLower();
        QTimer::singleShot(0, &window, [&] { takeAtStep(window, name); });
        window.run();
    }
}

void Layouts::takeAdvanced() {
    drive(Mode_Advanced, [this](CDlgSettingsImpl& window) {
        window.findChild<QComboBox*>(QStringLiteral("lstBxPreset"))
            ->setCurrentText(QStringLiteral("LandscapePro"));
        click(window, "btnRefresh");
        take(QStringLiteral("advanced-glued"));
        click(window, "btnSplitPreviews");
        take(QStringLiteral("advanced-split"));
        click(window, "btnGluePreviews");
        window.findChild<CWgtPaneAdvancedImpl*>()->on_btnExtendSettings_clicked();
        take(QStringLiteral("advanced-extended"));
    });
    drive(Mode_Advanced, [this](CDlgSettingsImpl& window) {
        takeAtStep(window, QStringLiteral("advanced-running"));
        click(window, "btnRefresh");
    });
}

void Layouts::takeFinalTouch() {
    drive(Mode_Advanced, [this](CDlgSettingsImpl& window) {
        window.findChild<QComboBox*>(QStringLiteral("lstBxPreset"))
            ->setCurrentText(QStringLiteral("LandscapePro"));
        click(window, "btnRefresh");
        click(window, "btnFinalTouch");
        take(QStringLiteral("final-touch"));
    });
}

void Layouts::takeOthers() {
    for (const auto& [mode, name] : {std::pair(Mode_Adjustments, "adjustments"),
                                     {Mode_AddIllumination, "add-illumination"},
                                     {Mode_ColorFilter, "color-filter"}})
        drive(mode, [this, name = name](CDlgSettingsImpl& window) {
            click(window, "btnTurnAllOn");
            click(window, "btnRefresh");
            take(QString::fromLatin1(name));
        });
}

} // namespace

bool takeLayouts(const QString& photo, const QString& folder, const QString& suffix) {
    const QImage image(photo);
    if (image.isNull()) {
        qWarning("gui_screenshots: cannot read %s", qPrintable(photo));
        return false;
    }
    return Layouts(image, folder, suffix).takeAll();
}
