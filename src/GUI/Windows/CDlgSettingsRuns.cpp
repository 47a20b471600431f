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

#include <QScopedValueRollback>

using namespace orvela;

void CDlgSettingsImpl::requestDraft() {
    if (!mPreviews || mRunning || !isVisible())
        return;
    DraftRunner::Request request;
    request.picture = mPreviews->originalCopy();
    request.host = mPane->takesProcessedImage() ? mOriginalCopy : request.picture;
    const Previews::Seen part = mPreviews->draftPart();
    request.area = part.area;
    request.reduction = part.reduction;
    request.params = CUserParamsPhotoshop(mMode);
    mPane->applyGUIParams(request.params);
    request.finalTouch = mMode == Mode_FinalTouch;
    request.tape = mWholeTape;
    if (request.picture && request.host && !request.area.isEmpty())
        mDrafts->request(std::move(request));
}

void CDlgSettingsImpl::startTimer() {
    if (chkBxAutoRefresh->isChecked())
        mRefreshTimer.start();
}

void CDlgSettingsImpl::on_chkBxAutoRefresh_clicked(bool checked) {
    btnRefresh->setVisible(!checked);
    if (checked && !mApplyOnFinish)
        startTimer();
}

// Asked for in the middle of a run, it is made up for once that has returned.
void CDlgSettingsImpl::on_btnRefresh_clicked() {
    if (mRunning) {
        mUpToDate = false;
        mRefreshWanted = true;
        mCore->stop();
        return;
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
    mStoppedByUser = false;
    CUserParamsPhotoshop params(mMode);
    mPane->applyGUIParams(params);
    mCore->setParams(params);
    if (mRunInNonInteractiveMode)
        applyNonIteractiveMode();
    if (mDrafts)
        mDrafts->cancel();
    mTape = std::make_shared<MeasurementTape>();
    mCore->recordTape(mPreviews ? mTape.get() : nullptr);
    const QScopedValueRollback<bool> running(mRunning, true);
    Q_EMIT mCore->started();
    mCore->run();
    Q_EMIT mCore->finished();
}

// What cannot be done beside the run that is under way comes after it.
void CDlgSettingsImpl::stopFor(const std::function<void()>& action) {
    mActionWanted = action;
    mCore->stop();
}

// What was asked for meanwhile. Not at once: this may be called from within a slot of the pane.
void CDlgSettingsImpl::runEnded() {
    const bool again = std::exchange(mRefreshWanted, false);
    const std::function<void()> action = std::exchange(mActionWanted, nullptr);
    if (!isVisible())
        return; // closed by what happened meanwhile
    tellFailures();
    if (action)
        QTimer::singleShot(0, this, action);
    else if (again)
        QTimer::singleShot(0, this, &CDlgSettingsImpl::on_btnRefresh_clicked);
}

void CDlgSettingsImpl::onMy_thrdCore_started() {
    if (mApplyOnFinish)
        btnOK->setEnabled(false);
    chkBxAutoRefresh->setEnabled(false);
    btnRefresh->hide();
    btnStopProcessing->show();
    mPane->setEnabled(false);
    mHistory->setUsable(false);
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

void CDlgSettingsImpl::onMy_thrdCore_finished() {
    chkBxAutoRefresh->setEnabled(true);
    btnStopProcessing->hide();
    btnRefresh->setVisible(!chkBxAutoRefresh->isChecked());
    btnOK->setEnabled(true);
    mPane->setEnabled(true);
    mHistory->setUsable(true);
    // A stopped run ends like any other, but its picture is not the one that was asked for.
    mUpToDate = !mRefreshWanted && !mStoppedByUser;
    if (mUpToDate && mCore->lastProcessingDone())
        mWholeTape = mTape;
    if (!mCore->lastProcessingDone()) {
        mApplyOnFinish = false; // nothing is there to apply
        return;
    }
    if (!isVisible())
        return;
    if (mApplyOnFinish && mUpToDate)
        accept();
    else if (mPreviews)
        showing([this] { mPreviews->showProcessed(*mOutPlane); });
}

void CDlgSettingsImpl::on_btnStopProcessing_clicked() {
    mApplyOnFinish = false;
    mRefreshWanted = false;
    mStoppedByUser = true;
    mCore->stop();
}

void CDlgSettingsImpl::on_btnOK_clicked() {
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
    mActionWanted = nullptr;
    if (mCore)
        mCore->stop();
    QDialog::reject();
}

void CDlgSettingsImpl::applyNonIteractiveMode() {
    if (!mRunInNonInteractiveMode)
        DebugBoxes::warningBox(this, tr("Warning"),
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

void CDlgSettingsImpl::tellFailures() {
    QString text;
    if (!mCore->lastProcessingDone())
        text = tr("The picture could not be processed: %1").arg(mCore->failure().cause);
    for (const TaskReport& report : mCore->reports())
        if (report.outcome == TaskOutcome::Failed && text.isEmpty())
            text = tr("A step of the processing failed and was left out: %1 (%2)")
                       .arg(report.failure.cause, QLatin1String(report.name));
    if (!text.isEmpty())
        DebugBoxes::warningBox(this, tr("Warning"), text);
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

// A preview that finds no memory stays as it was; the picture itself is not touched.
void CDlgSettingsImpl::showing(const std::function<void()>& action) {
    try {
        action();
    } catch (const CGenericEx& error) {
        Log::log(LogLevel::Warning, "The preview cannot be shown: %s", error.what());
    }
}
