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
#include "GUI/Preview/CSignaledGraphicsView.h"
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

#include <QScopedValueRollback>

using namespace orvela;

namespace {

constexpr int kRefreshMilliseconds = 1000;
const QString kSplit = QStringLiteral("CDlgSettingsImpl/previewsSplitted");
const QString kSelected = QStringLiteral("CDlgSettingsImpl/selectedPreset");

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
    for (QToolButton* button : findChildren<QToolButton*>())
        flatten({button});
    lblZoomLevel->setMinimumWidth(lblZoomLevel->fontMetrics().horizontalAdvance(QStringLiteral("66.7% ")));
    btnGluePreviews->hide();
    btnStopProcessing->hide();
    mRefreshTimer.setSingleShot(true);
    mRefreshTimer.setInterval(kRefreshMilliseconds);
    connect(&mRefreshTimer, &QTimer::timeout, this, &CDlgSettingsImpl::on_btnRefresh_clicked);
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
    const bool replays = batch.isBatchModeEnabled();
    const EGUIMode mode = replays ? static_cast<EGUIMode>(batch.batchMode()) : mMode;
    if (mode == Mode_Custom || CPresetStore::isFactoryMode(mode))
        runPreset(mode);
    else if (replays)
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
    changeMode(Mode_Advanced);
    if (mFailure)
        return;
    if (const int index = lstBxPreset->findText(name, Qt::MatchExactly | Qt::MatchCaseSensitive); index >= 0)
        lstBxPreset->setCurrentIndex(index);
    else
        mPane->setSliders(name); // a store that could not be written has no factory presets
    setWindowTitle(tr("Applying custom advanced filter:") + name);
    runWithoutDialogue();
}

void CDlgSettingsImpl::runBatch(EGUIMode mode) {
    changeMode(mode);
    if (mFailure)
        return;
    CPresetStore::loadPreset(mPane, mode, CPresetStore::batchPresetName());
    runWithoutDialogue();
}

void CDlgSettingsImpl::runWithoutDialogue() {
    mRunInNonInteractiveMode = true;
    show();
    btnOK->setEnabled(false);
    mApplyOnFinish = true;
    on_btnRefresh_clicked();
    CBatchMode::instance().setBatchMode(mMode);
}

void CDlgSettingsImpl::runInteractive(EGUIMode mode) {
    makePreviews();
    changeMode(mode);
    if (!mFailure)
        exec();
    CBatchMode::instance().setBatchMode(mMode);
}

void CDlgSettingsImpl::makePreviews() {
    mPreviews = std::make_unique<Previews>(this);
    addKeysToPreviews();
    CSignaledGraphicsView* original = mPreviews->originalView();
    CSignaledGraphicsView* processed = mPreviews->processedView();
    connect(original, &CSignaledGraphicsView::scrolledBy, this,
            &CDlgSettingsImpl::onMy_grphVwOriginal_scrolled);
    connect(processed, &CSignaledGraphicsView::scrolledBy, this,
            &CDlgSettingsImpl::onMy_grphVwProcessed_scrolled);
    for (CSignaledGraphicsView* view : {original, processed}) {
        connect(view, &CSignaledGraphicsView::sizeChanged, this, &CDlgSettingsImpl::previewWindowSizeChanged);
        connect(view, &CSignaledGraphicsView::zoomRequested, this,
                [this, view](int notches, QPoint at) { mPreviews->zoomAround(view, notches, at); });
    }
    connect(mPreviews.get(), &Previews::zoomChanged, lblZoomLevel, &QLabel::setText);
    mDrafts = std::make_unique<DraftRunner>();
    connect(mDrafts.get(), &DraftRunner::done, this,
            [this](const std::shared_ptr<CARGBPlane>& draft, const QRect& area) {
                if (!mRunning)
                    mPreviews->showDraft(draft, area);
            });
}

void CDlgSettingsImpl::changeMode(EGUIMode mode) {
    if (mRunning)
        return stopFor([this, mode] { changeMode(mode); });
    guarded([&] {
        const EGUIMode before = std::exchange(mMode, mode);
        if (before == Mode_Advanced && mode == Mode_FinalTouch) {
            mAdvancedPreset = lstBxPreset->currentIndex();
            mAdvancedAutoRefresh = chkBxAutoRefresh->isChecked();
        }
        setWindowTitle(Translations::modeName(mode));
        {
            const QScopedValueRollback<bool> together(mTogether, true);
            makePane(mode);
            makeCore();
            fillPresets();
            on_lstBxPreset_currentIndexChanged(lstBxPreset->currentText());
        }
        startTimer();
        QTimer::singleShot(0, this, &CDlgSettingsImpl::restoreWindowsStates);
        layout()->setSizeConstraint(QLayout::SetFixedSize);
        mUpToDate = false;
        if (before == Mode_FinalTouch && mode == Mode_Advanced) {
            lstBxPreset->setCurrentIndex(mAdvancedPreset);
            chkBxAutoRefresh->setChecked(mAdvancedAutoRefresh);
        }
        mHistory->begin(paneState());
    });
}

void CDlgSettingsImpl::makePane(EGUIMode mode) {
    if (mPane) {
        centralLayout->removeWidget(mPane);
        mPane->hide();
        mPane->deleteLater();
    }
    mPane = newPane(this, mode);
    connect(mPane, &IWgtPane::changeMode, this, &CDlgSettingsImpl::changeMode);
    centralLayout->addWidget(mPane);
    preparePane();
    enableProfiling(mPane->showsPresets());
    chkBxAutoRefresh->setChecked(mPane->autoRefresh());
    btnRefresh->setVisible(!mUpToDate);
    if (mUpToDate && !mApplyOnFinish)
        startTimer();
}

void CDlgSettingsImpl::makeCore() {
    if (mCore)
        mCore->deleteLater();
    mCore = nullptr;
    mWholeTape.reset(); // of another picture
    if (mDrafts)
        mDrafts->cancel();
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
        throw CGenericEx(QStringLiteral("The original picture is not at hand."), "CDlgSettingsImpl",
                         __LINE__);
    return direct->plane();
}

void CDlgSettingsImpl::enableProfiling(bool enabled) {
    frmPresets->setVisible(enabled);
}

void CDlgSettingsImpl::previewWindowSizeChanged(QRect geometry) {
    mPreviews->fitWidth(geometry);
}

void CDlgSettingsImpl::setSplitView(bool split) {
    btnSplitPreviews->setVisible(!split);
    btnGluePreviews->setVisible(split);
    mPreviews->setSplit(split);
}

void CDlgSettingsImpl::on_btnSplitPreviews_clicked() {
    setSplitView(true);
}

void CDlgSettingsImpl::on_btnGluePreviews_clicked() {
    setSplitView(false);
}

void CDlgSettingsImpl::onMy_grphVwOriginal_scrolled(int x, int y) {
    Previews::align(mPreviews->processedView(), x, y);
}

void CDlgSettingsImpl::onMy_grphVwProcessed_scrolled(int x, int y) {
    Previews::align(mPreviews->originalView(), x, y);
}

void CDlgSettingsImpl::on_btnZoomIn_clicked() {
    if (mPreviews)
        mPreviews->zoomIn();
}

void CDlgSettingsImpl::on_btnZoomOut_clicked() {
    if (mPreviews)
        mPreviews->zoomOut();
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
            block->setEnabled(on);
    });
}

void CDlgSettingsImpl::on_btnHelp_clicked() {
    if (mOpenPage)
        mOpenPage(helpTopicOf(mMode));
}

void CDlgSettingsImpl::restoreWindowsStates() {
    if (!isVisible() || std::exchange(mStatesRestored, true))
        return; // closed meanwhile, or where the user put it
    const QSettings settings = openSettings();
    restorePosition(*this);
    if (!mPreviews)
        return;
    mPreviews->restoreFrom(settings);
    setSplitView(PresetTree::switchOf(settings.value(PresetTree::guiKey(kSplit))));
    if (mMode == Mode_Advanced)
        selectPreset(settings.value(PresetTree::guiKey(kSelected), QStringLiteral("Automatic")).toString());
    mHistory->begin(paneState()); // nothing of this was the user's
}

void CDlgSettingsImpl::onMy_this_finished(int) {
    mRefreshTimer.stop();
    SettingsEdit edit;
    addPosition(edit, *this);
    edit.set(PresetTree::guiKey(kSelected), lstBxPreset->currentText());
    if (mPreviews) {
        edit.set(PresetTree::guiKey(kSplit), mPreviews->isSplit());
        mPreviews->saveTo(edit);
        mPreviews->hide();
    }
    StoreWriting::commit(edit, StoreWriting::Cause::Program);
}
