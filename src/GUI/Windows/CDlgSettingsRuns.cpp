// How the processing window starts, follows, stops and ends the runs of its core.
#include "Core/CThreadedCore.h"
#include "GUI/Panes/IWgtPane.h"
#include "GUI/Presets/CPresetStore.h"
#include "GUI/Preview/DraftRunner.h"
#include "GUI/Windows/CDlgSettingsImpl.h"
#include "GUI/Windows/PaneHistory.h"
#include "GUI/Windows/Previews.h"
#include "GUI/Windows/Translations.h"
#include "Utility/CGenericEx.h"
#include "Utility/DebugBoxes.h"
#include "Utility/Logger.h"

#include <QApplication>
#include <QMessageBox>
#include <QScopedValueRollback>

using namespace orvela;

void CDlgSettingsImpl::startTimer() {
    if (chkBxAutoRefresh->isChecked() && !mRunInNonInteractiveMode)
        mRefreshTimer.start();
}

// A run that reads the controls as they stand makes it needless, and nothing starts behind a box, a menu or a
// list that is open.
void CDlgSettingsImpl::refreshByItself() {
    if (QApplication::activePopupWidget() || QApplication::activeModalWidget() != this)
        mRefreshTimer.start();
    else if (mRun != Run::Whole)
        refresh();
}

void CDlgSettingsImpl::on_chkBxAutoRefresh_clicked(bool checked) {
    btnRefresh->setVisible(!checked);
    if (checked && !mApplyOnFinish)
        startTimer();
}

void CDlgSettingsImpl::on_btnRefresh_clicked() {
    mTold.clear();
    refresh();
}

// Asked for in the middle of a run, it is made up for once that has returned.
void CDlgSettingsImpl::refresh() {
    if (!isVisible())
        return;
    if (mRun != Run::None) {
        mRefreshWanted = true;
        return stopRun();
    }
    if (mUpToDate && mCore->lastProcessingDone()) {
        if (mApplyOnFinish)
            accept();
        return;
    }
    guarded([this] { runCore(); });
    runEnded();
}

void CDlgSettingsImpl::runCore() {
    mUpToDate = false;
    rest(true); // before the controls are read: it ends a drag or a number half typed
    dropDrafts();
    CUserParamsPhotoshop params(mMode);
    mPane->applyGUIParams(params);
    mCore->setParams(params);
    if (mRunInNonInteractiveMode)
        applyNonIteractiveMode();
    mTape = std::make_shared<MeasurementTape>();
    mCore->recordTape(mPreviews ? mTape.get() : nullptr);
    const QScopedValueRollback<Run> running(mRun, Run::Whole);
    Q_EMIT mCore->started();
    mCore->run();
    Q_EMIT mCore->finished();
}

void CDlgSettingsImpl::stopRun() {
    if (mRun == Run::None)
        return;
    mRun = Run::Spoilt;
    mCore->stop();
}

// Not at once, since this may be called from within a slot of the pane.
void CDlgSettingsImpl::whenIdle(const std::function<void()>& action) {
    mWaiting.append(action);
    if (mRun == Run::None)
        mGoOnTimer.start();
    else
        stopRun();
}

// A run that ended applies what OK asked for, or goes on with what came in meanwhile.
void CDlgSettingsImpl::runEnded() {
    if (!isVisible())
        return; // closed by what happened meanwhile
    const QString failure = failureText();
    if (!mCore->lastProcessingDone())
        mApplyOnFinish = false; // nothing is there to apply, and the user chooses what to do
    if (mApplyOnFinish && mUpToDate) {
        if (failure.isEmpty() || isWantedDespite(failure))
            return accept();
        mApplyOnFinish = false;
    }
    showResult();
    tell(failure);
    mRefreshWanted = mRefreshWanted || mApplyOnFinish; // the run was not the one that OK asked for
    if (mRefreshWanted || !mWaiting.isEmpty())
        mGoOnTimer.start();
}

// One thing at a time: each may open a box, close the window or be told of by its signals.
void CDlgSettingsImpl::goOn() {
    if (mRun != Run::None) // begun since
        return mWaiting.isEmpty() ? void() : stopRun();
    if (!mWaiting.isEmpty())
        mWaiting.takeFirst()();
    else if (std::exchange(mRefreshWanted, false))
        return refresh();
    if (isVisible() && (mRefreshWanted || !mWaiting.isEmpty()))
        mGoOnTimer.start();
}

// What changes the settings, or opens a box that would halt the run, waits for its end. The focus waits at
// the progress, where no key does harm: Qt would leave it nowhere, or on the next button that is in use.
void CDlgSettingsImpl::rest(bool resting) {
    for (QWidget* part : std::initializer_list<QWidget*>{mPane, frmPresets, chkBxAutoRefresh, btnTurnAllOn,
                                                         btnTurnAllOff, btnRefresh}) {
        if (resting)
            parkFocus(part);
        part->setEnabled(!resting);
    }
    mHistory->setUsable(!resting);
}

void CDlgSettingsImpl::parkFocus(const QWidget* part) {
    QWidget* focused = focusWidget();
    if (!focused || (part != focused && !part->isAncestorOf(focused)))
        return;
    mFocusBefore = focused;
    prgBrCoreStatus->setFocus(Qt::OtherFocusReason);
}

void CDlgSettingsImpl::giveFocusBack() {
    QWidget* before = std::exchange(mFocusBefore, nullptr);
    if (before && before->isVisible() && (!focusWidget() || focusWidget() == prgBrCoreStatus))
        before->setFocus(Qt::OtherFocusReason);
}

void CDlgSettingsImpl::onMy_thrdCore_started() {
    if (mApplyOnFinish)
        btnOK->setEnabled(false);
    btnRefresh->hide();
    btnStopProcessing->show();
    if (!mPane->takesProcessedImage())
        mInPlane->copyFrom(original());
}

void CDlgSettingsImpl::onMy_thrdCore_percentDone(int percent) {
    prgBrCoreStatus->setPercentage(percent);
}

// The name of the step is one for the log.
void CDlgSettingsImpl::onMy_thrdCore_stepDone(int step, int total, const QString&) {
    prgBrCoreStatus->setStep(step, total, Translations::stepTitle(mCore->stepTitle()));
    if (mPreviews)
        showing([this] { mPreviews->showStep(*mCore); });
    mCore->stepHandled();
}

void CDlgSettingsImpl::onMy_thrdCore_stepDone(int step, int total) {
    onMy_thrdCore_stepDone(step, total, QString());
}

// A stopped run ends like any other, but its picture is not the one that was asked for: OK makes another.
// Final Touch goes on from it, since that is the picture that is seen.
void CDlgSettingsImpl::onMy_thrdCore_finished() {
    rest(false);
    btnStopProcessing->hide();
    btnRefresh->setVisible(!chkBxAutoRefresh->isChecked());
    btnOK->setEnabled(true);
    giveFocusBack();
    mUpToDate = mRun == Run::Whole;
    if (mUpToDate && mCore->lastProcessingDone())
        mWholeTape = mTape;
}

void CDlgSettingsImpl::on_btnStopProcessing_clicked() {
    mApplyOnFinish = false;
    mRefreshWanted = false;
    stopRun();
}

void CDlgSettingsImpl::on_btnOK_clicked() {
    parkFocus(btnOK);
    btnOK->setEnabled(false);
    mApplyOnFinish = true;
    on_btnRefresh_clicked();
}

void CDlgSettingsImpl::on_btnCancel_clicked() {
    reject();
}

void CDlgSettingsImpl::accept() {
    bool isNew = false;
    savePresetAs(CPresetStore::batchPresetName(), true, isNew);
    QDialog::accept();
}

void CDlgSettingsImpl::reject() {
    mApplyOnFinish = false;
    mRefreshWanted = false;
    mWaiting.clear();
    stopRun();
    QDialog::reject();
}

void CDlgSettingsImpl::applyNonIteractiveMode() {
    if (!mRunInNonInteractiveMode)
        DebugBoxes::warningBox(static_cast<QWidget*>(this), tr("Warning"),
                               tr("Calling applyNonIteractiveMode when mRunInNonInteractiveMode is false."));
    for (QWidget* hidden : {frmPresets, frmCentralContainer, frmBottomContainer})
        hidden->hide();
    lineTop->hide();
    lineBottom->hide();
    frmTools->show();
    frmTools->setEnabled(true);
    for (QWidget* tool : frmTools->findChildren<QWidget*>())
        tool->hide();
    btnStopProcessing->setText(tr("Stop Processing"));
    btnStopProcessing->setToolButtonStyle(Qt::ToolButtonTextBesideIcon);
    btnStopProcessing->setEnabled(true);
    btnStopProcessing->show();
    for (QWidget* hidden : {btnOK, btnCancel, btnHelp})
        hidden->hide();
}

QString CDlgSettingsImpl::failureText() const {
    if (!mCore->lastProcessingDone())
        return tr("The picture could not be processed: %1").arg(mCore->failure().cause);
    for (const TaskReport& report : mCore->reports())
        if (report.outcome == TaskOutcome::Failed)
            return tr("A step of the processing failed and was left out: %1 (%2)")
                .arg(report.failure.cause, QLatin1String(report.name));
    return {};
}

bool CDlgSettingsImpl::isWantedDespite(const QString& failure) {
    mTold = failure;
    return QMessageBox::question(this, tr("Warning"),
                                 failure + QLatin1String("\n\n") + tr("Use the picture nevertheless?"),
                                 QMessageBox::Yes | QMessageBox::No) == QMessageBox::Yes;
}

// Once, and not after each of the runs that follow by themselves.
void CDlgSettingsImpl::tell(const QString& failure) {
    if (std::exchange(mTold, failure) != failure && !failure.isEmpty())
        DebugBoxes::warningBox(static_cast<QWidget*>(this), tr("Warning"), failure);
}

// Nothing may be thrown through the event loop. What keeps the mode from going on ends the dialogue and is
// thrown by run().
void CDlgSettingsImpl::guarded(const std::function<void()>& action) {
    try {
        action();
    } catch (...) {
        mFailure = std::current_exception();
        reject();
    }
}
