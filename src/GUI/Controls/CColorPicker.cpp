#include "GUI/Controls/CColorPicker.h"

#include "GUI/Controls/CColorPickerPopup.h"
#include "GUI/Controls/CIntValidator_FixUp.h"
#include "GUI/Controls/ControlAccessibility.h"
#include "GUI/Controls/CrispPaint.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QMouseEvent>
#include <QPainter>
#include <QScopedValueRollback>

using namespace orvela;

namespace {

constexpr QSize kSize(100, 14);
constexpr QSize kFieldSize(20, 12);
constexpr QSize kDigitsSize(18, 13); // the largest that the field shows whole, line spacing included
constexpr int kSmallestFont = 6;     // pixels
constexpr int kPopupShift = 17;
constexpr int kLightGray = 100; // from here on black reads better than white

} // namespace

CColorPicker::CColorPicker(QWidget* parent) : QWidget(parent), mPopup(new CColorPickerPopup(this)) {
    installControlAccessibility();
    setFixedSize(kSize);
    setFocusPolicy(Qt::StrongFocus);
    setAccessibleName(tr("Color"));
    auto* layout = new QHBoxLayout(this);
    layout->setContentsMargins(5, 1, 3, 1);
    layout->setSpacing(2);
    mRed = addField(layout, QStringLiteral("R"), QStringLiteral("redValue"), tr("Red"));
    mGreen = addField(layout, QStringLiteral("G"), QStringLiteral("greenValue"), tr("Green"));
    mBlue = addField(layout, QStringLiteral("B"), QStringLiteral("blueValue"), tr("Blue"));
    colorLabels();
    fitToFont();
    connect(mRed, &QLineEdit::textChanged, this, &CColorPicker::on_redValue_changed);
    connect(mGreen, &QLineEdit::textChanged, this, &CColorPicker::on_greenValue_changed);
    connect(mBlue, &QLineEdit::textChanged, this, &CColorPicker::on_blueValue_changed);
    connect(mPopup, &CColorPickerPopup::colorChanged, this, &CColorPicker::setColor);
}

QLineEdit* CColorPicker::addField(QBoxLayout* layout, const QString& label, const QString& object,
                                  const QString& name) {
    auto* caption = new QLabel(label, this);
    caption->setAttribute(Qt::WA_TransparentForMouseEvents); // a press there opens the colour field too
    auto* field = new QLineEdit(QStringLiteral("255"), this);
    field->setObjectName(object);
    field->setAccessibleName(name);
    field->setFrame(false);
    field->setAlignment(Qt::AlignRight);
    field->setFixedSize(kFieldSize);
    field->setTextMargins(-1, 0, -2, 0); // three digits need the field's whole width
    field->setValidator(new CIntValidator_FixUp(0, 255, field));
    mLabels.append(caption);
    layout->addWidget(caption);
    layout->addWidget(field);
    return field;
}

void CColorPicker::setColor(QColor NewColor) {
    NewColor = NewColor.toRgb();
    if (mAnnouncing && NewColor == mColor)
        return;
    mColor = NewColor;
    mRed->setText(QString::number(NewColor.red()));
    mGreen->setText(QString::number(NewColor.green()));
    mBlue->setText(QString::number(NewColor.blue()));
    announce();
}

void CColorPicker::on_redValue_changed(const QString& text) {
    mColor.setRed(text.toInt());
    announce();
}

void CColorPicker::on_greenValue_changed(const QString& text) {
    mColor.setGreen(text.toInt());
    announce();
}

void CColorPicker::on_blueValue_changed(const QString& text) {
    mColor.setBlue(text.toInt());
    announce();
}

void CColorPicker::announce() {
    const QScopedValueRollback<bool> announcing(mAnnouncing, true);
    colorLabels();
    update();
    Q_EMIT colorChanged(mColor);
}

// Black or white, whichever reads better on the colour.
QColor CColorPicker::readable() const {
    return qGray(mColor.rgb()) > kLightGray ? Qt::black : Qt::white;
}

void CColorPicker::colorLabels() {
    QPalette onColor = palette();
    onColor.setColor(QPalette::WindowText, readable());
    for (QLabel* label : mLabels)
        label->setPalette(onColor);
}

// The font of the surroundings, as large as three digits of it have room.
void CColorPicker::fitToFont() {
    QFont fitting = font();
    int pixels = QFontInfo(fitting).pixelSize();
    const auto fits = [&fitting](int size) {
        fitting.setPixelSize(size);
        const QFontMetrics metrics(fitting);
        return metrics.horizontalAdvance(QStringLiteral("255")) <= kDigitsSize.width() &&
               metrics.height() <= kDigitsSize.height();
    };
    while (!fits(pixels) && pixels > kSmallestFont)
        --pixels;
    for (QWidget* part : findChildren<QWidget*>(QString(), Qt::FindDirectChildrenOnly))
        if (!part->isWindow())
            part->setFont(fitting);
}

void CColorPicker::changeEvent(QEvent* event) {
    if (event->type() == QEvent::PaletteChange)
        colorLabels();
    if (event->type() == QEvent::FontChange)
        fitToFont();
    if (event->type() == QEvent::EnabledChange && !isEnabled())
        mPopup->hide();
    QWidget::changeEvent(event);
}

void CColorPicker::hideEvent(QHideEvent* event) {
    mPopup->hide();
    QWidget::hideEvent(event);
}

void CColorPicker::openField(const QPoint& pressed) {
    mPopup->open(mapToGlobal(QPoint(kPopupShift, 0)), mColor, pressed);
}

void CColorPicker::mousePressEvent(QMouseEvent* event) {
    if (event->button() == Qt::LeftButton)
        openField(event->globalPosition().toPoint());
    else
        event->ignore();
}

void CColorPicker::keyPressEvent(QKeyEvent* event) {
    if (event->key() == Qt::Key_Space || event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter)
        openField({});
    else
        QWidget::keyPressEvent(event);
}

void CColorPicker::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.setOpacity(isEnabled() ? 1 : CrispPaint::kDimmed);
    const QRectF swatch(kSwatchLeft, 0, width() - kSwatchLeft, height());
    painter.fillRect(CrispPaint::onGrid(painter, swatch), mColor);
    CrispPaint::frame(painter, swatch, Qt::black);
    if (hasFocus())
        CrispPaint::frame(painter, swatch.adjusted(1, 1, -1, -1), readable());
}
