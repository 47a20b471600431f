#include "GUI/Controls/COrvelaSliderBlockImpl.h"

#include "GUI/Controls/CDoubleValidator_FixUp.h"
#include "GUI/Controls/ControlAccessibility.h"

#include <QMouseEvent>
#include <QToolTip>

#include <algorithm>
#include <cmath>

using namespace orvela;

namespace {

constexpr double kLastPosition = 1000;
constexpr double kTextStep = 0.1; // the smallest difference that the text shows

double same(double value) {
    return value;
}

int mixed(int text, int base) {
    return (3 * text + 2 * base) / 5;
}

} // namespace

COrvelaSliderBlockImpl::COrvelaSliderBlockImpl(QWidget* parent)
    : QWidget(parent), mScale{same, same},
      mValidator(new CDoubleValidator_FixUp(0, kLastPosition, SliderScales::kDecimals, this)) {
    installControlAccessibility();
    setupUi(this);
    txtValue->setValidator(mValidator);
    txtValue->installEventFilter(this);
    sldrValue->setStepper([this](double value, double delta) { return stepped(value, delta); });
    fitToFont();
    fitToPalette();
    setText(lblName->text());
}

double COrvelaSliderBlockImpl::value() const {
    return sldrValue->value();
}

bool COrvelaSliderBlockImpl::isEnabled() const {
    return txtValue->isEnabledTo(this);
}

const QList<ZoneStop>& COrvelaSliderBlockImpl::zoneStops() const {
    return sldrValue->zoneStops();
}

void COrvelaSliderBlockImpl::setZoneStops(const QList<ZoneStop>& stops) {
    sldrValue->setZoneStops(stops);
}

void COrvelaSliderBlockImpl::on_sldrValue_valueChanged(double position) {
    txtValue->setText(mScale.text(position));
    if (!sldrValue->isDragging())
        Q_EMIT valueChanged(position);
}

void COrvelaSliderBlockImpl::on_txtValue_textChanged(const QString& text) {
    const double number = text.toDouble();
    const double position = mScale.toPosition(std::isfinite(number) ? number : 0);
    sldrValue->setValue(position);
    if (!sldrValue->isDragging())
        Q_EMIT valueChanged(position);
}

void COrvelaSliderBlockImpl::on_txtValue_editingFinished() {
    const double number = txtValue->text().toDouble();
    if (number >= mValidator->bottom() && number <= mValidator->top())
        return;
    const QString bottom = QString::number(mValidator->bottom());
    const QString message = lblName->text() + tr(" shall be in range: ") + bottom + tr(" to ") +
                            QString::number(mValidator->top());
    txtValue->setText(bottom);
    txtValue->setFocus();
    if (isVisible())
        QToolTip::showText(txtValue->mapToGlobal(QPoint(0, txtValue->height())), message, txtValue);
}

void COrvelaSliderBlockImpl::setMinMax(double newMin, double newMax) {
    mValidator->setBottom(std::min(newMin, newMax));
    mValidator->setTop(std::max(newMin, newMax));
}

void COrvelaSliderBlockImpl::setVirtualValue(double NewVal) {
    sldrValue->setValue(mScale.toPosition(NewVal));
    txtValue->setText(SliderScales::textOf(NewVal));
}

void COrvelaSliderBlockImpl::setValue(double NewVal) {
    sldrValue->setValue(NewVal);
    txtValue->setText(mScale.text(NewVal));
}

void COrvelaSliderBlockImpl::setEnabled(bool isEnabled) {
    if (isEnabled == sldrValue->isEnabledTo(this))
        return;
    sldrValue->setEnabled(isEnabled);
    txtValue->setEnabled(isEnabled);
    QFont font = txtValue->font();
    font.setItalic(!isEnabled); // off shows without colour too
    txtValue->setFont(font);
    Q_EMIT stateChanged(isEnabled);
}

void COrvelaSliderBlockImpl::setText(const QString& NewName) {
    lblName->setText(NewName);
    setAccessibleName(NewName);
    sldrValue->setAccessibleName(NewName);
    txtValue->setAccessibleName(NewName);
}

void COrvelaSliderBlockImpl::setHelp(const QString& help) {
    sldrValue->setToolTip(help);
    sldrValue->setAccessibleDescription(help);
    setWhatsThis(help);
}

// A step too small for the text to show it goes on to the text's next number.
double COrvelaSliderBlockImpl::stepped(double position, double delta) const {
    const double target = std::clamp(position + delta, 0.0, kLastPosition);
    if (mScale.text(target) != mScale.text(position))
        return target;
    const double from = mScale.toShown(position);
    const double step = mScale.toShown(target) < from ? -kTextStep : kTextStep;
    return target == position ? target : std::clamp(mScale.toPosition(from + step), 0.0, kLastPosition);
}

bool COrvelaSliderBlockImpl::eventFilter(QObject* watched, QEvent* event) {
    if (watched != txtValue || event->type() != QEvent::MouseButtonDblClick)
        return QWidget::eventFilter(watched, event);
    setEnabled(!isEnabled());
    return true;
}

void COrvelaSliderBlockImpl::mouseDoubleClickEvent(QMouseEvent*) {
    setEnabled(!isEnabled());
}

void COrvelaSliderBlockImpl::mousePressEvent(QMouseEvent* event) {
    const int x = event->position().toPoint().x();
    const QRect slider = sldrValue->geometry();
    if (!sldrValue->isEnabled() || x < slider.left() || x > slider.right())
        return QWidget::mousePressEvent(event);
    sldrValue->setFocus(Qt::MouseFocusReason);
    forwardToSlider(event);
}

void COrvelaSliderBlockImpl::mouseMoveEvent(QMouseEvent* event) {
    if (sldrValue->isDragging())
        forwardToSlider(event);
}

void COrvelaSliderBlockImpl::mouseReleaseEvent(QMouseEvent* event) {
    if (sldrValue->isDragging())
        forwardToSlider(event);
}

void COrvelaSliderBlockImpl::forwardToSlider(QMouseEvent* event) {
    QMouseEvent forwarded(event->type(), sldrValue->mapFrom(this, event->position()), event->scenePosition(),
                          event->globalPosition(), event->button(), event->buttons(), event->modifiers());
    QCoreApplication::sendEvent(sldrValue, &forwarded);
}

void COrvelaSliderBlockImpl::changeEvent(QEvent* event) {
    if (event->type() == QEvent::FontChange)
        fitToFont();
    if (event->type() == QEvent::PaletteChange)
        fitToPalette();
    QWidget::changeEvent(event);
}

// Equal widths of labels and fields let the sliders of a list of blocks stand in one column.
void COrvelaSliderBlockImpl::fitToFont() {
    const QFontMetrics metrics = fontMetrics();
    lblName->setMinimumWidth(metrics.horizontalAdvance(QStringLiteral("Digital Flash ")));
    txtValue->setFixedWidth(metrics.horizontalAdvance(QStringLiteral("10000.00")) + 8);
}

// The number of a setting that is off stays readable: styles draw it fainter than that.
void COrvelaSliderBlockImpl::fitToPalette() {
    const QColor text = palette().color(QPalette::Active, QPalette::Text);
    const QColor base = palette().color(QPalette::Active, QPalette::Base);
    QPalette faint;
    faint.setColor(QPalette::Disabled, QPalette::Text,
                   QColor(mixed(text.red(), base.red()), mixed(text.green(), base.green()),
                          mixed(text.blue(), base.blue())));
    txtValue->setPalette(faint);
}
