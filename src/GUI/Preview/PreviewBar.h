#pragma once

#include <QWidget>

class QAction;
class QKeySequence;
class QLabel;
class QToolButton;

namespace orvela {

class HistogramView;

/// What stands below the processed picture: its histogram and the buttons that no other place has.
class PreviewBar : public QWidget {
    Q_OBJECT

public:
    explicit PreviewBar(QWidget* parent = nullptr);

    HistogramView& histogram() const { return *mHistogram; }
    /// Says that what is shown is a draft.
    void setDraft(bool draft);
    void setComparing(bool comparing);
    /// Puts keys into the tool tips.
    /// @param keys  of fitting, of showing every pixel, of comparing, and those that move its line left and
    /// right
    /// @param hold  shows the original while it is held
    void tellKeys(const QList<QAction*>& keys, const QKeySequence& hold);

Q_SIGNALS:
    void fitRequested();
    void pixelsRequested();
    void comparingChanged(bool comparing);

private:
    HistogramView* mHistogram;
    QLabel* mDraft;
    QToolButton* mFit;
    QToolButton* mPixels;
    QToolButton* mCompare;
};

} // namespace orvela
