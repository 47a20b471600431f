#pragma once

#include <QWidget>

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

Q_SIGNALS:
    void fitRequested();
    void pixelsRequested();
    void comparingChanged(bool comparing);

private:
    QToolButton* addButton(const QString& text, const QString& help);

    HistogramView* mHistogram;
    QLabel* mDraft;
    QToolButton* mCompare;
};

} // namespace orvela
