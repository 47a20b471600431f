#pragma once

#include "Utility/CARGBPlane.h"

#include <QWidget>

#include <array>

namespace orvela {

/// How often each level of luma and colour occurs in a picture.
struct LevelCounts {
    using Counts = std::array<double, 256>;

    Counts luma = {};
    std::array<Counts, 3> channels = {};

    /// Of every so many pixels that about a million are counted.
    static LevelCounts of(const CARGBPlane& picture);
};

/// The histogram of a picture, and the luma of the one before as a line over it.
class HistogramView : public QWidget {
    Q_OBJECT

public:
    explicit HistogramView(QWidget* parent = nullptr);

    void setCounts(const LevelCounts& counts);
    void setBefore(const LevelCounts& counts);

    QSize sizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QPolygonF curve(const LevelCounts::Counts& counts, double most) const;

    LevelCounts mCounts;
    LevelCounts mBefore;
};

} // namespace orvela
