#include "GUI/Preview/PreviewPicture.h"

#include "GUI/Preview/CGridCell.h"
#include "GUI/Preview/CompareCurtain.h"
#include "GUI/Preview/PreviewScene.h"

#include <atomic>

namespace orvela {

namespace {
constexpr double kOverPicture = 1.5;
}

void PreviewPicture::show(const CARGBPlane& picture) {
    dropPart();
    const bool reusable = mPlane && mPlane.use_count() == 1 && mPlane->width() == picture.width() &&
                          mPlane->height() == picture.height();
    if (reusable) {                                          // fresh memory takes longer than the copy
        std::atomic_thread_fence(std::memory_order_acquire); // drafts on another thread have read it before
        mPlane->copyFrom(picture);
    } else {
        mPlane = std::make_shared<CARGBPlane>(picture, QStringLiteral("Preview"));
    }
    PreviewScene::show(mScene, *mPlane);
    if (!mCurtain) // one that hangs may be in the user's hand
        hangCurtain();
}

void PreviewPicture::showPart(std::shared_ptr<const CARGBPlane> part, const QRect& area) {
    dropPart();
    if (part->pixelCount() == 0)
        return;
    mPart = std::move(part);
    auto* cell = new CGridCell(*mPart, 0, 0, mPart->width() - 1, mPart->height() - 1);
    cell->setZValue(kOverPicture);
    cell->setPos(area.topLeft());
    cell->setTransform(QTransform::fromScale(double(area.width()) / mPart->width(),
                                             double(area.height()) / mPart->height()));
    mScene.addItem(cell);
    mPartItem = cell;
}

void PreviewPicture::dropPart() {
    delete mPartItem;
    mPartItem = nullptr;
    mPart.reset();
}

void PreviewPicture::setBefore(std::shared_ptr<const CARGBPlane> before) {
    mBefore = std::move(before);
    hangCurtain();
}

void PreviewPicture::setComparing(bool comparing) {
    mComparing = comparing;
    hangCurtain();
}

void PreviewPicture::moveLine(double by) {
    if (mComparing && mCurtain)
        mCurtain->setShare(mCurtain->share() + by);
}

void PreviewPicture::setHeld(bool held) {
    if (mHeld == held)
        return;
    mHeld = held;
    hangCurtain();
}

void PreviewPicture::hangCurtain() {
    if (mCurtain)
        mShare = mCurtain->share();
    delete mCurtain;
    mCurtain = nullptr;
    if (!mBefore || !mPlane || mBefore->pixelCount() == 0 || !(mComparing || mHeld))
        return;
    mCurtain = new CompareCurtain(mBefore, mShare);
    mCurtain->setHeld(mHeld);
    mScene.addItem(mCurtain);
}

} // namespace orvela
