#include "GUI/Windows/CDlgSettingsImpl.h"

#include "Core/CThreadedCore.h"
#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Panes/CWgtPane3SlidersImpl.h"
#include "GUI/Panes/CWgtPaneAdvancedImpl.h"
#include "GUI/Panes/CWgtPaneFinalTouchImpl.h"
#include "GUI/Panes/CWgtPaneGenericImpl.h"
#include "GUI/Presets/CBatchMode.h"
#include "GUI/Presets/CPresetStore.h"
#include "GUI/Presets/StoreWriting.h"
#include "GUI/Preview/DraftRunner.h"
#include "GUI/Windows/CDlgCustomPresetImpl.h"
#include "GUI/Windows/PaneHistory.h"
#include "GUI/Windows/Previews.h"
#include "GUI/Windows/Translations.h"
#include "GUI/Windows/WindowSetup.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Settings/PresetTree.h"
#include "Settings/SettingsStore.h"
#include "Utility/CGenericEx.h"
#include "Utility/DebugBoxes.h"

#include <QApplication>
#include <QResizeEvent>
#include <QScopedValueRollback>
#include <QScreen>

using namespace orvela;

namespace {

const QString kSplit = QStringLiteral("CDlgSettingsImpl/previewsSplitted");

bool isSingleFilter(EGUIMode mode) {
    return mode >= Mode_SmartSharpness && mode <= Mode_ColorFilter;
}

QString helpTopicOf(EGUIMode mode) {
    switch (mode) {
    case Mode_Adjustments:
        return QStringLiteral("adjustments.htm");
    case Mode_AddIllumination:
        return QStringLiteral("illumination.htm");
    case Mode_Advanced:
        return QStringLiteral("advancedenhancementoptions.htm");
    case Mode_FinalTouch:
        return QStringLiteral("finaltouch.htm");
    default:
        if (isSingleFilter(mode) || mode == Mode_SmartLevels)
            return QStringLiteral("allfilterfunctions.htm");
        DebugBoxes::debugWarning(QStringLiteral("unknown mode in on_btnHelp_clicked"),
                                 QStringLiteral("Help Error"));
        return QStringLiteral("Unknown mode");
    }
}

IWgtPane* newPane(QWidget* owner, EGUIMode mode) {
    if (mode == Mode_FinalTouch)
        return new CWgtPaneFinalTouchImpl(owner, mode);
    if (isSingleFilter(mode))
        return new CWgtPaneGenericImpl(owner, mode);
    if (mode == Mode_SmartLevels || mode == Mode_Adjustments)
        return new CWgtPane3SlidersImpl(owner, mode);
    return new CWgtPaneAdvancedImpl(owner, mode);
}

} // namespace

CDlgSettingsImpl::CDlgSettingsImpl(EGUIMode mode, CARGBPlane* inPlane, CARGBPlane* outPlane, QWidget* parent,
                                   Qt::WindowFlags flags)
    : QDialog(parent, flags), mMode(mode), mInPlane(inPlane), mOutPlane(outPlane) {
    setupUi(this);
    mRuns.setParent(this); // found below the window, as all that belongs to it
    for (QToolButton* button : findChildren<QToolButton*>())
        flatten({button});
    nameByToolTips(*this);
    lblZoomLevel->setMinimumWidth(lblZoomLevel->fontMetrics().horizontalAdvance(QStringLiteral("66.7% ")));
    btnGluePreviews->hide();
    btnStopProcessing->hide();
    for (QTimer* timer : {&mDraftTimer, &mRestoreTimer})
        timer->setSingleShot(true);
    connect(&mDraftTimer, &QTimer::timeout, this, &CDlgSettingsImpl::makeDraft);
    connect(&mRestoreTimer, &QTimer::timeout, this, &CDlgSettingsImpl::restoreWindowsStates);
    connect(chkBxAutoRefresh, &QCheckBox::toggled, this,
            [this](bool checked) { mRuns.setAutomatic(checked && !mRunInNonInteractiveMode); });
    connect(this, &QDialog::finished, this, &CDlgSettingsImpl::onMy_this_finished);
    connect(lstBxPreset, &QComboBox::currentIndexChanged, this,
            [this](int index) { on_lstBxPreset_currentIndexChanged(lstBxPreset->itemText(index)); });
    mHistory = new PaneHistory([this](const PaneState& state) { showPaneState(state); }, this);
    addKeys();
    acceptDropsOn(this);
    CPresetStore::ensureFactoryPresets(this);
    // A native window is to be there before anything else happens.
    show();
    hide();
}

CDlgSettingsImpl::~CDlgSettingsImpl() = default;

void CDlgSettingsImpl::run() {
    const CBatchMode& batch = CBatchMode::instance();
    mReplays = mObeysBatchMode && batch.replays();
    const EGUIMode mode = mReplays ? static_cast<EGUIMode>(batch.batchMode()) : mMode;
    if (mode == Mode_Custom || CPresetStore::isFactoryMode(mode))
        runPreset(mode);
    else if (mReplays)
        runBatch(mode);
    else
        runInteractive(mode);
    if (mFailure)
        std::rethrow_exception(std::exchange(mFailure, nullptr));
}

void CDlgSettingsImpl::runPreset(EGUIMode mode) {
    const QString name = mode == Mode_Custom ? CDlgCustomPresetImpl::choose(this, mOpenPage)
                                             : CPresetStore::factoryPresetName(mode);
    if (name.isEmpty())
        return;
    mRunInNonInteractiveMode = true;
    changeMode(Mode_Advanced);
    if (mFailure)
        return;
    if (const int index = lstBxPreset->findText(name, Qt::MatchExactly | Qt::MatchCaseSensitive); index >= 0)
        lstBxPreset->setCurrentIndex(index);
    else
        mPane->setSliders(name); // a store that could not be written has no factory presets
    setWindowTitle(tr("Applying custom advanced filter:") + name);
    runWithoutDialogue();
    CBatchMode::instance().setBatchMode(mMode);
}

void CDlgSettingsImpl::runBatch(EGUIMode mode) {
    mRunInNonInteractiveMode = true;
    changeMode(mode);
    if (mFailure)
        return;
    CPresetStore::loadPreset(mPane, mode, CPresetStore::batchPresetName());
    runWithoutDialogue();
}

void CDlgSettingsImpl::runWithoutDialogue() {
    show();
    btnOK->setEnabled(false);
    mRuns.applyToTheEnd(); // no event loop goes on after this
}

void CDlgSettingsImpl::runInteractive(EGUIMode mode) {
    makePreviews();
    changeMode(mode);
    if (!mFailure)
        exec();
    CBatchMode::instance().setBatchMode(mMode);
}

void CDlgSettingsImpl::changeMode(EGUIMode mode) {
    if (mRuns.isRunning())
        return mRuns.whenIdle([this, mode] {
            mRuns.forget(); // the picture of this pane was asked for, not of the next
            changeMode(mode);
        });
    guarded([&] {
        const EGUIMode before = std::exchange(mMode, mode);
        if (before == Mode_Advanced && mode == Mode_FinalTouch) {
            mAdvancedPreset = lstBxPreset->currentIndex();
            mSelectedPreset = lstBxPreset->currentText();
            mAdvancedAutoRefresh = chkBxAutoRefresh->isChecked();
        }
        setWindowTitle(Translations::modeName(mode));
        const bool wasUpToDate = mRuns.isUpToDate();
        {
            const QScopedValueRollback<bool> together(mTogether, true);
            makePane(mode);
            makeCore();
            fillPresets();
            on_lstBxPreset_currentIndexChanged(lstBxPreset->currentText());
            if (before == Mode_FinalTouch && mode == Mode_Advanced) {
                if (mAdvancedPreset < 0)
                    selectStoredPreset();
                else
                    lstBxPreset->setCurrentIndex(mAdvancedPreset);
                chkBxAutoRefresh->setChecked(mAdvancedAutoRefresh);
            }
        }
        mRestoreTimer.start();
        layout()->setSizeConstraint(QLayout::SetFixedSize);
        mRuns.outdate();
        beginPane(wasUpToDate);
    });
}

// Final Touch goes on from the result of these sliders, not from what was processed before them.
void CDlgSettingsImpl::leavePane(EGUIMode mode) {
    if (mode == Mode_FinalTouch) {
        on_btnRefresh_clicked();
        if (!isVisible() || !mRuns.isUpToDate())
            return; // closed, stopped, or failed, which was told
    }
    changeMode(mode);
}

void CDlgSettingsImpl::makePane(EGUIMode mode) {
    if (mPane) {
        centralLayout->removeWidget(mPane);
        mPane->hide();
        mPane->deleteLater();
    }
    mPane = newPane(this, mode);
    connect(mPane, &IWgtPane::changeMode, this, &CDlgSettingsImpl::leavePane);
    centralLayout->addWidget(mPane);
    preparePane();
    enableProfiling(mPane->showsPresets());
    chkBxAutoRefresh->setChecked(mPane->autoRefresh());
}

// Follows the results of the pane before: where they were up to date, those of this one are a second later.
// Once everything else stands, since it tells of changes too; and where nothing comes by itself the button is
// always there, or there would be no way on.
void CDlgSettingsImpl::beginPane(bool wasUpToDate) {
    btnRefresh->setVisible(!wasUpToDate || !chkBxAutoRefresh->isChecked());
    if (wasUpToDate && !mRuns.applies())
        mRuns.startTimer();
    mHistory->begin(paneState());
}

void CDlgSettingsImpl::makeCore() {
    if (mCore)
        mCore->deleteLater();
    mCore = nullptr;
    mWholeTape.reset(); // of another picture
    dropDrafts();
    prepareInput();
    mCore = mPane->createCore(mInPlane, mOutPlane, this);
    connect(mCore, &CThreadedCore::started, this, &CDlgSettingsImpl::onMy_thrdCore_started);
    for (const auto ended : {&CThreadedCore::finished, &CThreadedCore::terminated})
        connect(mCore, ended, this, &CDlgSettingsImpl::onMy_thrdCore_finished);
    connect(mCore, &CThreadedCore::percentDone, this, &CDlgSettingsImpl::onMy_thrdCore_percentDone);
    connect(mCore, &CThreadedCore::stepDone, this,
            qOverload<int, int, const QString&>(&CDlgSettingsImpl::onMy_thrdCore_stepDone));
}

void CDlgSettingsImpl::prepareInput() {
    mInPlane->copyFrom(mPane->takesProcessedImage() ? *mOutPlane : original());
    if (!mPreviews)
        return;
    showing([this] {
        if (mPane->takesProcessedImage())
            mOriginalCopy = mPreviews->originalCopy(); // of the pane before
        mPreviews->showOriginal(*mInPlane);
        mPreviews->showProcessed(*mInPlane);
    });
}

const CARGBPlane& CDlgSettingsImpl::original() const {
    const auto* direct = dynamic_cast<const CARGBPlaneProxyDirect*>(CARGBPlaneProxy::current());
    if (!direct)
        throw CGenericEx(QStringLiteral(QT_TRANSLATE_NOOP("Failure", "The original picture is not at hand.")),
                         "CDlgSettingsImpl", __LINE__);
    return direct->plane();
}

void CDlgSettingsImpl::resizeEvent(QResizeEvent* event) {
    QDialog::resizeEvent(event);
    const QRect frame = frameGeometry();
    const QRect before(frame.topLeft(), frame.size() - event->size() + event->oldSize());
    if (isVisible() && screen()->availableGeometry().contains(before))
        keepOnScreen(*this);
}

void CDlgSettingsImpl::enableProfiling(bool enabled) {
    frmPresets->setVisible(enabled);
}

void CDlgSettingsImpl::on_btnTurnAllOn_clicked() {
    turnAll(true);
}

void CDlgSettingsImpl::on_btnTurnAllOff_clicked() {
    turnAll(false);
}

void CDlgSettingsImpl::turnAll(bool on) {
    together(on ? tr("all sliders on") : tr("all sliders off"), [this, on] {
        for (COrvelaSliderBlockImpl* block : mPane->findChildren<COrvelaSliderBlockImpl*>())
            if (!on || !block->isHidden()) // nobody could switch off again what is never shown
                block->setEnabled(on);
    });
}

void CDlgSettingsImpl::on_btnHelp_clicked() {
    if (mOpenPage)
        mOpenPage(helpTopicOf(mMode));
}

// Once: later the windows are where the user put them, and the preset is that of the way back from Final
// Touch. Runs without dialogue have no previews, and their preset is not the window's last one.
void CDlgSettingsImpl::restoreWindowsStates() {
    if (!isVisible() || std::exchange(mStatesRestored, true))
        return; // closed meanwhile
    const QSettings settings = openSettings();
    restorePosition(*this);
    if (!mPreviews)
        return;
    mPreviews->restoreFrom(settings);
    setSplitView(PresetTree::switchOf(settings.value(PresetTree::guiKey(kSplit))));
    if (mMode == Mode_Advanced) {
        const QScopedValueRollback<bool> together(mTogether, true);
        selectStoredPreset();
        mRuns.settingsChanged();
    }
    mHistory->begin(paneState()); // nothing of this was the user's
}

// What was stored stays where this window was closed before it came to stand by it.
void CDlgSettingsImpl::onMy_this_finished(int) {
    while (QWidget* popup = QApplication::activePopupWidget())
        popup->close(); // such as the menu of the pane, whose loop would go on
    mRuns.close();
    mDraftTimer.stop();
    mRestoreTimer.stop();
    if (mStatesRestored)
        storeWindowsStates();
    if (mPreviews)
        mPreviews->hide();
}

// What a run without previews, or a window without presets, cannot tell stays as it was.
void CDlgSettingsImpl::storeWindowsStates() const {
    SettingsEdit edit;
    addPosition(edit, *this);
    if (mPreviews) {
        const QString selected = mMode == Mode_Advanced ? lstBxPreset->currentText() : mSelectedPreset;
        if (!selected.isEmpty())
            edit.set(selectedPresetKey(), selected);
        edit.set(PresetTree::guiKey(kSplit), mPreviews->isSplit());
        mPreviews->saveTo(edit);
    }
    StoreWriting::commit(edit, StoreWriting::Cause::Program);
}
