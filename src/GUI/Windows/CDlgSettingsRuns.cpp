// How the processing window starts, follows, stops and ends the runs of its core.
#include "Core/CThreadedCore.h"
#include "GUI/Controls/CThinHorizontalSlider.h"
#include "GUI/Panes/IWgtPane.h"
#include "GUI/Presets/CPresetStore.h"
#include "GUI/Preview/DraftRunner.h"
#include "GUI/Windows/CDlgSettingsImpl.h"
#include "GUI/Windows/PaneHistory.h"
#include "GUI/Windows/Previews.h"
#include "GUI/Windows/Translations.h"
#include "Utility/Logger.h"

#include <QApplication>
#include <QMessageBox>

#include <algorithm>

using namespace orvela;

void CDlgSettingsImpl::on_chkBxAutoRefresh_clicked(bool checked) {
    btnRefresh->setVisible(!checked);
    if (!mRuns.applies())
        mRuns.startTimer();
}

void CDlgSettingsImpl::on_btnRefresh_clicked() {
    mTold.clear();
    mRuns.refresh();
}

// The controls rest before they are read: it ends a drag or a number half typed.
bool CDlgSettingsImpl::prepareRun() {
    return guarded([this] {
        rest(true);
        dropDrafts();
        CUserParamsPhotoshop params(mMode);
        mPane->applyGUIParams(params);
        mCore->setParams(params);
        if (mRunInNonInteractiveMode)
            applyNonIteractiveMode();
        mTape = std::make_shared<MeasurementTape>();
        mCore->recordTape(mPreviews ? mTape.get() : nullptr);
    });
}

void CDlgSettingsImpl::runCore() {
    guarded([this] {
        Q_EMIT mCore->started();
        mCore->run();
        Q_EMIT mCore->finished();
    });
}

void CDlgSettingsImpl::stopCore() {
    mCore->stop();
}

bool CDlgSettingsImpl::isRunComplete() const {
    return mCore->lastProcessingDone();
}

void CDlgSettingsImpl::runEnded() {
    if (mRuns.isUpToDate())
        mWholeTape = mTape;
    showResult();
    if (!mRuns.goesOn())
        tell(failureText());
}

bool CDlgSettingsImpl::useResult() {
    const QString failure = failureText();
    if (failure.isEmpty() || isWantedDespite(failure)) {
        accept();
        return true;
    }
    btnOK->setEnabled(true);
    giveFocusBack();
    return false;
}

// With a slider in hand, or a box, a menu or a list open.
bool CDlgSettingsImpl::isUserBusy() const {
    const auto sliders = mPane->findChildren<CThinHorizontalSlider*>();
    return std::ranges::any_of(sliders, &CThinHorizontalSlider::isDragging) ||
           QApplication::activePopupWidget() || QApplication::activeModalWidget() != this;
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
    if (mRuns.applies())
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

void CDlgSettingsImpl::onMy_thrdCore_finished() {
    rest(false);
    btnStopProcessing->hide();
    btnStopProcessing->setEnabled(true);
    btnRefresh->setVisible(!chkBxAutoRefresh->isChecked());
    btnOK->setEnabled(true);
    giveFocusBack();
}

// The button tells at once that it was pressed: not every task ends in the midst of its rows.
void CDlgSettingsImpl::on_btnStopProcessing_clicked() {
    if (btnStopProcessing->hasFocus()) // it would go to the next button
        prgBrCoreStatus->setFocus(Qt::OtherFocusReason);
    btnStopProcessing->setEnabled(!mRuns.isRunning());
    mRuns.stop();
}

void CDlgSettingsImpl::on_btnOK_clicked() {
    parkFocus(btnOK);
    btnOK->setEnabled(false);
    mTold.clear();
    mRuns.apply();
}

void CDlgSettingsImpl::on_btnCancel_clicked() {
    reject();
}

void CDlgSettingsImpl::accept() {
    try {
        bool isNew = false;
        savePresetAs(CPresetStore::batchPresetName(), true, isNew);
    } catch (const std::exception& error) { // the picture is made all the same
        Log::log(LogLevel::Warning, "These settings cannot be replayed: %s", error.what());
    }
    QDialog::accept();
}

void CDlgSettingsImpl::reject() {
    mRuns.stop();
    QDialog::reject();
}

void CDlgSettingsImpl::applyNonIteractiveMode() {
    if (!mRunInNonInteractiveMode)
        QMessageBox::warning(this, tr("Warning"),
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
    if (!isRunComplete())
        return tr("The picture could not be processed: %1").arg(Translations::causeOf(mCore->failure()));
    const auto& reports = mCore->reports();
    const auto failed = std::ranges::find(reports, TaskOutcome::Failed, &TaskReport::outcome);
    if (failed == reports.end())
        return {};
    return tr("A step of the processing failed and was left out: %1 (%2)")
        .arg(Translations::causeOf(failed->failure), Translations::stepTitle(failed->stepTitle));
}

// Nobody is there to answer in batch mode, which uses what it has.
bool CDlgSettingsImpl::isWantedDespite(const QString& failure) {
    if (mReplays) {
        Log::log(LogLevel::Warning, "%s", failure.toUtf8().constData());
        return true;
    }
    mTold = failure;
    return QMessageBox::question(this, tr("Warning"),
                                 failure + QLatin1String("\n\n") + tr("Use the picture nevertheless?"),
                                 QMessageBox::Yes | QMessageBox::No) == QMessageBox::Yes;
}

// Once, and not after each of the runs that follow by themselves.
void CDlgSettingsImpl::tell(const QString& failure) {
    if (std::exchange(mTold, failure) != failure && !failure.isEmpty())
        QMessageBox::warning(this, tr("Warning"), failure);
}

// Nothing may be thrown through the event loop. What keeps the mode from going on ends the dialogue and is
// thrown by run().
bool CDlgSettingsImpl::guarded(const std::function<void()>& action) {
    try {
        action();
        return true;
    } catch (...) {
        mFailure = std::current_exception();
        reject();
        return false;
    }
}
