#include "GUI/Preview/PreviewPicture.h"

#include "GUI/Preview/CGridCell.h"
#include "GUI/Preview/CompareCurtain.h"
#include "GUI/Preview/PreviewScene.h"

namespace orvela {

namespace {
constexpr double kOverPicture = 1.5;
}

void PreviewPicture::show(const CARGBPlane& picture) {
    auto copy = std::make_shared<const CARGBPlane>(picture, QStringLiteral("Preview"));
    if (mCurtain)
        mShare = mCurtain->share();
    PreviewScene::show(mScene, *copy); // deletes every item
    mCurtain = nullptr;
    mPartItem = nullptr;
    mPart.reset();
    mPlane = std::move(copy);
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
