#include "GUI/Controls/COrvelaStatusIndicator.h"

#include "GUI/Controls/ControlAccessibility.h"
#include "GUI/Controls/CrispPaint.h"

#include <QAccessible>
#include <QPainter>

#include <algorithm>

using namespace orvela;

namespace {

constexpr int kHeight = 18;
constexpr int kPercentHeight = 6;

} // namespace

COrvelaStatusIndicator::COrvelaStatusIndicator(QWidget* parent) : QWidget(parent) {
    installControlAccessibility();
    setFixedHeight(kHeight);
    setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Fixed);
    setAccessibleName(tr("Progress"));
}

QSize COrvelaStatusIndicator::sizeHint() const {
    return {200, kHeight};
}

void COrvelaStatusIndicator::setStep(int Step, int TotalSteps, const QString& NextStepName) {
    mStep = static_cast<unsigned>(Step);
    mTotalSteps = static_cast<unsigned>(TotalSteps);
    if (!NextStepName.isEmpty())
        mStepName = NextStepName;
    setToolTip(mStepName);
    update();
}

void COrvelaStatusIndicator::setStep(int Step, int TotalSteps) {
    setStep(Step, TotalSteps, QString());
}

void COrvelaStatusIndicator::setPercentage(int Percentage) {
    mPercentage = static_cast<float>(Percentage);
    update();
    QAccessibleValueChangeEvent change(this, Percentage);
    QAccessible::updateAccessibility(&change);
}

double COrvelaStatusIndicator::stepWidth() const {
    const double whole = width() - 1;
    return mTotalSteps == 0 ? 0 : std::min(whole, whole * mStep / mTotalSteps);
}

void COrvelaStatusIndicator::fill(QPainter& painter, const QRectF& rect, const QColor& top,
                                  const QColor& bottom) const {
    QLinearGradient shade(0, 0, 0, height());
    shade.setColorAt(0, top);
    shade.setColorAt(1, bottom);
    painter.fillRect(CrispPaint::onGrid(painter, rect), shade);
}

void COrvelaStatusIndicator::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    fill(painter, rect(), QColor(150, 150, 155), QColor(245, 245, 255));
    fill(painter, QRectF(0, 0, stepWidth(), height()), QColor(200, 215, 255), QColor(120, 125, 160));
    const QRectF percent(0, height() - kPercentHeight, width() / 100.0 * mPercentage, kPercentHeight);
    if (mPercentage > 0)
        painter.fillRect(CrispPaint::onGrid(painter, percent), QColor(100, 240, 40));
}
