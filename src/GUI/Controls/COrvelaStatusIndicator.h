#pragma once

#include <QWidget>

class QPainter;

/// The progress of a run: a bar for the steps done and, along its foot, one for the percentage of the current
/// step. 18 pixels high. The name of the step is its tool tip, and told to assistive tools.
class COrvelaStatusIndicator : public QWidget {
    Q_OBJECT

public:
    explicit COrvelaStatusIndicator(QWidget* parent = nullptr);

    unsigned step() const { return mStep; }
    unsigned totalSteps() const { return mTotalSteps; }
    float percentage() const { return mPercentage; }
    const QString& stepName() const { return mStepName; }

    QSize sizeHint() const override;

public Q_SLOTS:
    /// @param NextStepName  keeps the name before when empty
    void setStep(int Step, int TotalSteps, const QString& NextStepName);
    void setStep(int Step, int TotalSteps);
    /// Of the current step, 0 to 100.
    void setPercentage(int Percentage);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    double stepWidth() const;
    void fill(QPainter& painter, const QRectF& rect, const QColor& top, const QColor& bottom) const;

    unsigned mTotalSteps = 1;
    unsigned mStep = 0;
    float mPercentage = 0;
    QString mStepName = QStringLiteral("Progress");
};
