#include "GUI/Windows/CDlgMainImpl.h"

#include "GUI/Controls/Artwork.h"
#include "GUI/Controls/KeyTips.h"
#include "GUI/Presets/CBatchMode.h"
#include "GUI/Presets/StoreWriting.h"
#include "GUI/Windows/CDlgAboutImpl.h"
#include "GUI/Windows/CDlgProgramInfosImpl.h"
#include "GUI/Windows/CDlgSettingsImpl.h"
#include "GUI/Windows/HelpWindow.h"
#include "GUI/Windows/MessageBoxes.h"
#include "GUI/Windows/Translations.h"
#include "GUI/Windows/WindowSetup.h"
#include "Platform/WindowParent.h"
#include "Settings/PresetTree.h"
#include "Settings/SettingsStore.h"
#include "Update/RunningVersion.h"
#include "Update/UpdateServer.h"
#include "Utility/CGenericEx.h"

#include <QAction>
#include <QCloseEvent>
#include <QMenu>
#include <QMessageBox>
#include <QPointer>

using namespace orvela;

namespace {

constexpr int kExpandedWidth = 124;
constexpr int kCollapsedWidth = 26;
constexpr char kBatchProperty[] = "BatchModeState";
const QString kExpanded = QStringLiteral("CDlgMainImpl/expanded");

struct FilterEntry {
    EGUIMode mode; ///< ignored for a separator
    const char* icon;
};

constexpr FilterEntry kSeparator = {Mode_Automatic, nullptr};
constexpr FilterEntry kFilterMenu[] = {
    {Mode_SmartSharpness, ":/All Filters/Sharpen_24x24.png"},
    {Mode_SmartBlur, ":/All Filters/SmartSharpen_24x24.png"},
    kSeparator,
    {Mode_AddDigitalFlash, ":/All Filters/Flash_Icon._24x24.png"},
    {Mode_Saturation, ":/All Filters/Saturation_24x24.png"},
    kSeparator,
    {Mode_SmartContrast, ":/All Filters/SmartContrast01_24x24.png"},
    {Mode_SmartBrightness, ":/All Filters/SmartBrightness_24x24.png"},
    {Mode_SmartGamma, ":/All Filters/SmartGamma 24x24.png"},
    {Mode_SmartLevels, ":/All Filters/SmartLevels01_24x24.png"},
    kSeparator,
    {Mode_SpotsRemoval, ":/All Filters/BW Noise 24x24.png"},
    {Mode_NoiseReduction, ":/All Filters/Noise 24x24.png"},
    {Mode_MoireReduction, ":/All Filters/Moire 24x24.png"},
    kSeparator,
    {Mode_Temperature, ":/All Filters/Temperature1_24x24.png"},
    {Mode_AutoColorFilter, ":/All Filters/AutoColor02_24x24.png"},
    {Mode_ColorFilter, ":/All Filters/Filter_24x24.png"},
    kSeparator,
};

template <typename Dialog>
void runDialog(QWidget* parent) {
    const QPointer<Dialog> dialog = new Dialog(parent);
    dialog->exec();
    if (dialog) // its parent may have gone, and it with it
        dialog->deleteLater();
}

} // namespace

CDlgMainImpl::CDlgMainImpl(void* hostWindow, CARGBPlane* inPlane, CARGBPlane* outPlane)
    : mInPlane(inPlane), mOutPlane(outPlane) {
    initArtwork();
    setupUi(this);
    setMainWindow(*this);
    winId(); // the native window is to be there
    setHostParent(*windowHandle(), hostWindow);
    setWindowFlags(Qt::Tool | Qt::WindowStaysOnTopHint);
    restoreState();
    setWindowTitle(tr("Orvela %1").arg(kRunningVersion, 0, 'g'));
    flatten({btnCollapse, btnExpand});
    nameByToolTips(*this);
    auto* help = new QAction(this); // a button would lose the key with its text
    help->setShortcut(QKeySequence::HelpContents);
    connect(help, &QAction::triggered, btnHelp, &QToolButton::click);
    addAction(help);
    btnHelp->setToolTip(withKeys(btnHelp->toolTip(), help->shortcuts()));
    if (qEnvironmentVariableIsSet("ORVELA_STYLESHEET"))
        setStyleSheet(
            QStringLiteral("color: white;background: qlineargradient(x1: 0, y1: 0, x2: 0, y2: 1, stop: 0 "
                           "#333333, stop: 1.0 #AAAAAA)"));
    mWantedBatchState = CBatchMode::instance().isBatchModeEnabled();
    nameBatchButton();
    showUpdateLink();
}

CDlgMainImpl::~CDlgMainImpl() {
    if (mBatchStateChanged)
        CBatchMode::instance().setBatchModeEnabled(mWantedBatchState);
}

void CDlgMainImpl::restoreState() {
    if (PresetTree::switchOf(openSettings().value(PresetTree::guiKey(kExpanded))))
        on_btnExpand_clicked();
    else
        on_btnCollapse_clicked();
    restorePosition(*this);
}

void CDlgMainImpl::showUpdateLink() {
    const QSettings settings = openSettings();
    const QString key = QStringLiteral("UpdateAvailable");
    updateAvailableLabel->setVisible(settings.contains(key));
    updateAvailableLabel->setText(QStringLiteral("<a href=\"http://%1/update%2.html\">%3</>")
                                      .arg(updateServer().host.toHtmlEscaped(),
                                           settings.value(key).toString().toHtmlEscaped(),
                                           tr("Update Available").toHtmlEscaped()));
}

// A batch run that was stopped counts as cancelled: its picture is not written.
bool CDlgMainImpl::run() {
    if (CBatchMode::instance().replays())
        startMode(Mode_Batch);
    else
        exec();
    if (mFailure)
        std::rethrow_exception(std::exchange(mFailure, nullptr));
    return result() == Accepted;
}

// Nothing may be thrown through the event loop: a failure ends the window and is thrown by run().
void CDlgMainImpl::startMode(EGUIMode mode) {
    setEnabled(false);
    try {
        runMode(mode);
    } catch (...) {
        mFailure = std::current_exception();
        reject();
    }
    setEnabled(true);
}

void CDlgMainImpl::runMode(EGUIMode mode) {
    CDlgSettingsImpl window(mode, mInPlane, mOutPlane, this);
    window.setHelp([this](const QString& page) { openHelpPage(page); });
    window.setObeysBatchMode(mode == Mode_Batch); // this window was shown: the user has chosen
    window.run();
    if (window.appliesOnFinish())
        return accept();
    // Recorded as failures are, and nothing more: the user chooses again.
    [[maybe_unused]] const CGenericEx cancelled(QStringLiteral("User cancel."), "CDlgMainImpl", __LINE__);
}

// However it closes: an accepted dialog gets no close event. In batch mode it was nowhere.
void CDlgMainImpl::done(int result) {
    if (isVisible()) {
        SettingsEdit edit;
        addPosition(edit, *this);
        edit.set(PresetTree::guiKey(kExpanded), isExpanded());
        StoreWriting::commit(edit, StoreWriting::Cause::Program);
    }
    QDialog::done(result);
}

// The frame of a window that is disabled still closes it: not while a mode runs, whose result would be
// written all the same.
void CDlgMainImpl::closeEvent(QCloseEvent* event) {
    if (isEnabled())
        return QDialog::closeEvent(event);
    event->ignore();
}

void CDlgMainImpl::on_btnExpand_clicked() {
    btnExpand->hide();
    btnCollapse->show();
    setButtonTexts(true);
    layout()->setSizeConstraint(QLayout::SetFixedSize);
    refreshBatchButton();
    setButtonWidths(kExpandedWidth, "text-align: left;");
}

void CDlgMainImpl::on_btnCollapse_clicked() {
    btnCollapse->hide();
    btnExpand->show();
    setButtonTexts(false);
    layout()->setSizeConstraint(QLayout::SetFixedSize);
    setButtonWidths(kCollapsedWidth, "text-align: center;");
}

void CDlgMainImpl::setButtonTexts(bool shown) {
    const std::initializer_list<std::pair<QToolButton*, QString>> texts = {
        {btnAutomatic, QCoreApplication::translate("CDlgMain", "Automatic")},
        {btnAutoContrast, QCoreApplication::translate("CDlgMain", "Auto Contrast")},
        {btnAutoLevels, QCoreApplication::translate("CDlgMain", "Auto Levels")},
        {btnAutoColor, QCoreApplication::translate("CDlgMain", "Auto Color")},
        {btnAutoSaturation, QCoreApplication::translate("CDlgMain", "Auto Saturation")},
        {btnAdjustments, QCoreApplication::translate("CDlgMain", "Adjustments")},
        {btnAddIllumination, QCoreApplication::translate("CDlgMain", "Add Illumination")},
        {btnAdvanced, QCoreApplication::translate("CDlgMain", "Advanced")},
        {btnCustomPresets, QCoreApplication::translate("CDlgMain", "Custom")},
        {btnIndivFilters, QCoreApplication::translate("CDlgMain", "All Filters")},
        {btnHelp, QCoreApplication::translate("CDlgMain", "Help")},
        {btnAbout, QCoreApplication::translate("CDlgMain", "About")},
    };
    for (const auto& [button, text] : texts) {
        button->setText(shown ? text : QString());
        button->setAccessibleName(text);
    }
    if (!shown)
        btnToggleBatchMode->setText(QString()); // no text has room
}

// Not those of windows that belong to this one, such as the manual's.
QList<QToolButton*> CDlgMainImpl::ownButtons() const {
    return findChildren<QToolButton*>(QString(), Qt::FindDirectChildrenOnly);
}

void CDlgMainImpl::setButtonWidths(int width, const char* styleSheet) {
    const QList<QToolButton*> buttons = ownButtons();
    for (QToolButton* button : buttons) {
        button->setFixedWidth(width);
        button->setStyleSheet(QLatin1String(styleSheet));
    }
    fitTexts(buttons, font(), width);
}

void CDlgMainImpl::on_btnToggleBatchMode_clicked() {
    mBatchStateChanged = true;
    mWantedBatchState = !btnToggleBatchMode->property(kBatchProperty).toBool();
    refreshBatchButton();
}

void CDlgMainImpl::tellBatchMode() {
    const QString text =
        tr("Batch mode is now enabled! Next time when you start Orvela, Orvela will process the image "
           "with "
           "the last operation you performed with orvela.\n\nTo disable batch mode, hold <b>SHIFT</b> "
           "pressed when selecting Orvela from Plug-ins menu.");
    QMessageBox box(QMessageBox::Information, tr("Batch Mode Enabled"),
                    QString(text).replace(QLatin1Char('\n'), QLatin1String("<br>")), QMessageBox::Ok, this);
    box.setTextFormat(Qt::RichText); // looked at by itself only the first line would count
    box.exec();
}

void CDlgMainImpl::nameBatchButton() {
    btnToggleBatchMode->setAccessibleName(mWantedBatchState
                                              ? QCoreApplication::translate("CDlgMain", "Batch Mode is on")
                                              : QCoreApplication::translate("CDlgMain", "Batch Mode is off"));
}

void CDlgMainImpl::refreshBatchButton() {
    if (mWantedBatchState)
        tellBatchMode();
    nameBatchButton();
    if (isExpanded()) {
        btnToggleBatchMode->setText(btnToggleBatchMode->accessibleName());
        fitTexts(ownButtons(), font(), kExpandedWidth);
    }
    btnToggleBatchMode->setProperty(kBatchProperty, mWantedBatchState);
    btnToggleBatchMode->setIcon(QIcon(mWantedBatchState ? QStringLiteral(":/Main UI/Batch01_On_24x24.png")
                                                        : QStringLiteral(":/Main UI/Batch01_Off_24x24.png")));
}

void CDlgMainImpl::on_btnIndivFilters_clicked() {
    auto* menu = new QMenu(this);
    menu->setAttribute(Qt::WA_DeleteOnClose);
    for (const FilterEntry& entry : kFilterMenu) {
        if (!entry.icon) {
            menu->addSeparator();
            continue;
        }
        QAction* action = menu->addAction(
            QIcon(QLatin1String(entry.icon)),
            Translations::modeName(entry.mode).replace(QLatin1Char('&'), QLatin1String("&&")));
        action->setData(int(entry.mode));
        connect(action, &QAction::triggered, this, &CDlgMainImpl::indivFilterActionClicked);
    }
    menu->popup(QCursor::pos());
}

void CDlgMainImpl::indivFilterActionClicked() {
    if (const auto* action = qobject_cast<QAction*>(sender()))
        startMode(static_cast<EGUIMode>(action->data().toInt()));
}

void CDlgMainImpl::on_btnHelp_clicked() {
    openHelpPage(QStringLiteral("welcome.htm"));
}

void CDlgMainImpl::openHelpPage(const QString& page) {
    openHelp(page, this);
}

void CDlgMainImpl::on_btnAbout_clicked() {
    setEnabled(false);
    doAbout(this);
    setEnabled(true);
}

void CDlgMainImpl::doAbout(QDialog* parent) {
    runDialog<CDlgAboutImpl>(parent);
}

void CDlgMainImpl::doAbout() {
    doAbout(nullptr);
}

void CDlgMainImpl::doProgramInfos(QDialog* parent) {
    runDialog<CDlgProgramInfosImpl>(parent);
}

void CDlgMainImpl::doProgramInfos() {
    doProgramInfos(nullptr);
}

void CDlgMainImpl::on_btnAddIllumination_clicked() {
    startMode(Mode_AddIllumination);
}

void CDlgMainImpl::on_btnAutomatic_clicked() {
    startMode(Mode_Automatic);
}

void CDlgMainImpl::on_btnAutoLevels_clicked() {
    startMode(Mode_AutoLevels);
}

void CDlgMainImpl::on_btnAutoContrast_clicked() {
    startMode(Mode_AutoContrast);
}

void CDlgMainImpl::on_btnAutoColor_clicked() {
    startMode(Mode_AutoColor);
}

void CDlgMainImpl::on_btnAutoSaturation_clicked() {
    startMode(Mode_AutoSaturation);
}

void CDlgMainImpl::on_btnAdjustments_clicked() {
    startMode(Mode_Adjustments);
}

void CDlgMainImpl::on_btnAdvanced_clicked() {
    startMode(Mode_Advanced);
}

void CDlgMainImpl::on_btnCustomPresets_clicked() {
    startMode(Mode_Custom);
}
