#pragma once

#include "Utility/CARGBPlane.h"

#include <QGraphicsScene>
#include <QRect>

#include <memory>

namespace orvela {

class CompareCurtain;

/// What a preview shows: a copy of a picture of its own, so that nothing is painted that a run writes
/// meanwhile, and whatever lies over it.
class PreviewPicture {
public:
    QGraphicsScene& scene() { return mScene; }
    const QGraphicsScene& scene() const { return mScene; }

    /// The copy; null before anything was shown.
    std::shared_ptr<const CARGBPlane> plane() const { return mPlane; }

    /// Shows a copy of `picture`.
    /// @throws CGenericEx when the memory for it cannot be had; what was shown stays
    void show(const CARGBPlane& picture);

    /// Shows a part over the picture until the next one is shown.
    /// @param part  the area's pixels, reduced or not
    /// @param area  in pixels of the picture
    void showPart(std::shared_ptr<const CARGBPlane> part, const QRect& area);
    void dropPart();

    /// What is compared with; null for nothing.
    void setBefore(std::shared_ptr<const CARGBPlane> before);
    /// A line across the picture, left of which the picture before is seen.
    void setComparing(bool comparing);
    bool isComparing() const { return mComparing; }
    /// Moves that line, where there is one, by a share of the picture's width.
    void moveLine(double by);
    /// The whole picture before in place of this one.
    void setHeld(bool held);

private:
    void hangCurtain();

    QGraphicsScene mScene;
    std::shared_ptr<CARGBPlane> mPlane;
    std::shared_ptr<const CARGBPlane> mPart;
    QGraphicsItem* mPartItem = nullptr;
    std::shared_ptr<const CARGBPlane> mBefore;
    CompareCurtain* mCurtain = nullptr; ///< owned by the scene
    double mShare = 0.5;
    bool mComparing = false;
    bool mHeld = false;
};

} // namespace orvela
