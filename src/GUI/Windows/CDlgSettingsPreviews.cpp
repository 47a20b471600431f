// The previews of the processing window: what they show, and how they are moved.
#include "Core/CThreadedCore.h"
#include "GUI/Panes/IWgtPane.h"
#include "GUI/Preview/CSignaledGraphicsView.h"
#include "GUI/Preview/DraftRunner.h"
#include "GUI/Windows/CDlgSettingsImpl.h"
#include "GUI/Windows/Previews.h"
#include "Utility/Logger.h"

using namespace orvela;

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
                if (!mRuns.isRunning())
                    showing([&] { mPreviews->showDraft(draft, area); });
            });
    connect(mPreviews.get(), &Previews::seenPartChanged, this, &CDlgSettingsImpl::seenPartChanged);
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

// However many signals one change sends, it makes one draft.
void CDlgSettingsImpl::requestDraft() {
    if (mPreviews && !mRuns.isRunning() && isVisible())
        mDraftTimer.start();
}

void CDlgSettingsImpl::makeDraft() {
    if (mRuns.isRunning())
        return;
    DraftRunner::Request request;
    request.picture = mPreviews->originalCopy();
    request.host = mPane->takesProcessedImage() ? mOriginalCopy : request.picture;
    const Previews::Seen part = mPreviews->draftPart(mDrafts->pixelsAtOnce());
    request.area = part.area;
    request.reduction = part.reduction;
    request.params = CUserParamsPhotoshop(mMode);
    mPane->writeSettings(request.params.mSliderParams);
    request.finalTouch = mMode == Mode_FinalTouch;
    request.tape = mWholeTape;
    mDraftsSeen = request.picture && request.host && !request.area.isEmpty();
    if (mDraftsSeen)
        mDrafts->request(std::move(request));
}

void CDlgSettingsImpl::dropDrafts() {
    mDraftTimer.stop();
    mDraftsSeen = false;
    if (mDrafts)
        mDrafts->cancel();
}

// Another part of the picture is seen than the last draft or step shows.
void CDlgSettingsImpl::seenPartChanged() {
    if (mRuns.isRunning())
        mPreviews->showNextStep();
    else if (mDraftsSeen)
        requestDraft();
}

void CDlgSettingsImpl::showResult() {
    if (!mPreviews)
        return;
    if (mCore->lastProcessingDone())
        showing([this] { mPreviews->showProcessed(*mOutPlane); });
    else
        mPreviews->dropStep();
}

// A preview that finds no memory stays as it was; the picture itself is not touched.
void CDlgSettingsImpl::showing(const std::function<void()>& action) {
    try {
        action();
    } catch (const std::exception& error) {
        Log::log(LogLevel::Warning, "The preview cannot be shown: %s", error.what());
    }
}
