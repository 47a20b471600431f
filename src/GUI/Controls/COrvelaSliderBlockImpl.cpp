#include "GUI/Controls/COrvelaSliderBlockImpl.h"

#include "GUI/Controls/CDoubleValidator_FixUp.h"
#include "GUI/Controls/ControlAccessibility.h"
#include "GUI/Controls/CrispPaint.h"
#include "GUI/Controls/KeyTips.h"

#include <QAccessible>
#include <QApplication>
#include <QMouseEvent>
#include <QPainter>
#include <QToolTip>

#include <algorithm>
#include <cmath>
#include <utility>

using namespace orvela;

namespace {

constexpr double kLastPosition = 1000;
constexpr double kTextStep = 0.1;   // the smallest difference that the text shows
constexpr double kWheelNotch = 120; // eighths of a degree
constexpr double kFineSteps = 0.1;

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
    setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Fixed);
    txtValue->setValidator(mValidator);
    for (QWidget* part : {static_cast<QWidget*>(sldrValue), static_cast<QWidget*>(txtValue)})
        part->installEventFilter(this);
    connect(lmpState, &QAbstractButton::toggled, this, &COrvelaSliderBlockImpl::setEnabled);
    sldrValue->setStepper([this](double value, double delta) { return stepped(value, delta); });
    lmpState->setToolTip(withKeys(lmpState->toolTip(), {Qt::Key_Space}));
    fitToFont();
    fitToPalette();
    setText(lblName->text());
}

double COrvelaSliderBlockImpl::value() const {
    return sldrValue->value();
}

double COrvelaSliderBlockImpl::exactValue() const {
    const bool stands = value() == mGiven || value() == mScale.told(mGiven);
    return std::clamp(stands ? mGiven : value(), 0.0, kLastPosition);
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
    if (sldrValue->isDragging())
        return;
    sldrValue->setValue(mScale.told(position)); // also when the text is the same
    Q_EMIT valueChanged(value());
}

void COrvelaSliderBlockImpl::on_txtValue_textChanged(const QString& text) {
    const double number = text.toDouble();
    const double position = mScale.toPosition(std::isfinite(number) ? number : 0);
    sldrValue->setValue(position);
    QAccessibleValueChangeEvent change(sldrValue, number);
    QAccessible::updateAccessibility(&change);
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
    mGiven = mScale.toPosition(NewVal);
    sldrValue->setValue(mGiven);
    txtValue->setText(SliderScales::textOf(NewVal));
}

void COrvelaSliderBlockImpl::setValue(double NewVal) {
    mGiven = NewVal;
    sldrValue->setValue(NewVal);
    txtValue->setText(mScale.text(NewVal));
}

void COrvelaSliderBlockImpl::setEnabled(bool isEnabled) {
    if (isEnabled == sldrValue->isEnabledTo(this))
        return;
    if (!isEnabled && (sldrValue->hasFocus() || txtValue->hasFocus()))
        lmpState->setFocus(Qt::OtherFocusReason);
    sldrValue->setEnabled(isEnabled);
    txtValue->setEnabled(isEnabled);
    lmpState->setChecked(isEnabled);
    QFont font = txtValue->font();
    font.setItalic(!isEnabled); // off shows without colour too
    txtValue->setFont(font);
    Q_EMIT stateChanged(isEnabled);
}

void COrvelaSliderBlockImpl::setText(const QString& NewName) {
    lblName->setText(NewName);
    for (QWidget* part : std::initializer_list<QWidget*>{this, lmpState, sldrValue, txtValue})
        part->setAccessibleName(NewName);
}

void COrvelaSliderBlockImpl::setHelp(const QString& help) {
    for (QWidget* part : std::initializer_list<QWidget*>{lblName, sldrValue, txtValue})
        part->setToolTip(help);
    for (QWidget* part : std::initializer_list<QWidget*>{lmpState, sldrValue, txtValue})
        part->setAccessibleDescription(help);
    setWhatsThis(help);
}

int COrvelaSliderBlockImpl::labelWidth() const {
    return lblName->sizeHint().width();
}

void COrvelaSliderBlockImpl::setLabelWidth(int width) {
    lblName->setMinimumWidth(width);
}

int COrvelaSliderBlockImpl::sliderLeft() const {
    return lmpState->sizeHint().width() + lblName->minimumWidth() + 2 * gridLayout->horizontalSpacing();
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

// Up is the larger number, also on a scale that runs down.
bool COrvelaSliderBlockImpl::stepNumber(const QKeyEvent& event) {
    if (event.key() != Qt::Key_Up && event.key() != Qt::Key_Down)
        return false;
    const bool right = (event.key() == Qt::Key_Up) == (mScale.low() <= mScale.high());
    const double step = event.modifiers().testFlag(Qt::ControlModifier) ? kFineSteps : 1;
    sldrValue->stepBy(right ? step : -step);
    return true;
}

// The first press of the double click was one on the slider and moved it: that was not meant.
bool COrvelaSliderBlockImpl::switchByDoubleClick(const QMouseEvent& event) {
    if (event.button() != Qt::LeftButton || !QWidget::isEnabled())
        return false;
    if (mBeforePress)
        setValue(*std::exchange(mBeforePress, std::nullopt));
    setEnabled(!isEnabled());
    return true;
}

void COrvelaSliderBlockImpl::notePress(const QObject* pressed, const QMouseEvent& event) {
    if (event.button() == Qt::LeftButton)
        mBeforePress = pressed == sldrValue ? std::optional(exactValue()) : std::nullopt;
}

bool COrvelaSliderBlockImpl::eventFilter(QObject* watched, QEvent* event) {
    switch (event->type()) {
    case QEvent::MouseButtonPress:
        notePress(watched, *static_cast<QMouseEvent*>(event));
        break;
    case QEvent::MouseButtonDblClick:
        return watched == txtValue && switchByDoubleClick(*static_cast<QMouseEvent*>(event));
    case QEvent::KeyPress:
        return stepNumber(*static_cast<QKeyEvent*>(event));
    case QEvent::FocusIn:
    case QEvent::FocusOut:
        update(); // the ring around the slider
        break;
    default:
        break;
    }
    return QWidget::eventFilter(watched, event);
}

void COrvelaSliderBlockImpl::mouseDoubleClickEvent(QMouseEvent* event) {
    switchByDoubleClick(*event);
}

void COrvelaSliderBlockImpl::mousePressEvent(QMouseEvent* event) {
    notePress(this, *event);
    const int x = event->position().toPoint().x();
    const QRect slider = sldrValue->geometry();
    if (event->button() != Qt::LeftButton || !sldrValue->isEnabled() || x < slider.left() ||
        x > slider.right())
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

// Elsewhere than in the row with the focus the surroundings scroll.
void COrvelaSliderBlockImpl::wheelEvent(QWheelEvent* event) {
    if (!sldrValue->isEnabled() || !isAncestorOf(QApplication::focusWidget()))
        return event->ignore();
    mWheelRest += event->angleDelta().y() / kWheelNotch;
    const double notches = std::trunc(mWheelRest);
    mWheelRest -= notches;
    if (notches != 0)
        sldrValue->stepBy(event->modifiers().testFlag(Qt::ControlModifier) ? notches * kFineSteps : notches);
    event->accept();
}

void COrvelaSliderBlockImpl::paintEvent(QPaintEvent*) {
    if (!sldrValue->hasFocus())
        return;
    QPainter painter(this);
    CrispPaint::focusRing(painter, QRectF(sldrValue->geometry()).adjusted(-3, -3, 3, 3), palette());
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
    setLabelWidth(metrics.horizontalAdvance(QStringLiteral("Digital Flash ")));
    txtValue->setFixedWidth(metrics.horizontalAdvance(QStringLiteral("10000.0")) + 12);
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
