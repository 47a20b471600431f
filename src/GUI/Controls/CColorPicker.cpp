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
constexpr int kFontPixels = 9;
constexpr int kSwatchLeft = 2;
constexpr int kSwatchHeight = 16; // the lower edge lies below the widget
constexpr int kPopupShift = 17;
constexpr int kLightGray = 100; // from here on black reads better than white

} // namespace

CColorPicker::CColorPicker(QWidget* parent) : QWidget(parent), mPopup(new CColorPickerPopup(this)) {
    installControlAccessibility();
    setFixedSize(kSize);
    setAccessibleName(tr("Color"));
    auto* layout = new QHBoxLayout(this);
    layout->setContentsMargins(5, 1, 3, 1);
    layout->setSpacing(2);
    mRed = addField(layout, QStringLiteral("R"), QStringLiteral("redValue"), tr("Red"));
    mGreen = addField(layout, QStringLiteral("G"), QStringLiteral("greenValue"), tr("Green"));
    mBlue = addField(layout, QStringLiteral("B"), QStringLiteral("blueValue"), tr("Blue"));
    colorLabels();
    connect(mRed, &QLineEdit::textChanged, this, &CColorPicker::on_redValue_changed);
    connect(mGreen, &QLineEdit::textChanged, this, &CColorPicker::on_greenValue_changed);
    connect(mBlue, &QLineEdit::textChanged, this, &CColorPicker::on_blueValue_changed);
    connect(mPopup, &CColorPickerPopup::colorChanged, this, &CColorPicker::setColor);
}

QLineEdit* CColorPicker::addField(QBoxLayout* layout, const QString& label, const QString& object,
                                  const QString& name) {
    QFont small = font();
    small.setPixelSize(kFontPixels);
    auto* caption = new QLabel(label, this);
    caption->setFont(small);
    caption->setAttribute(Qt::WA_TransparentForMouseEvents); // a press there opens the colour field too
    auto* field = new QLineEdit(QStringLiteral("255"), this);
    field->setObjectName(object);
    field->setAccessibleName(name);
    field->setFont(small);
    field->setFrame(false);
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
void CColorPicker::colorLabels() {
    QPalette readable = palette();
    readable.setColor(QPalette::WindowText, qGray(mColor.rgb()) > kLightGray ? Qt::black : Qt::white);
    for (QLabel* label : mLabels)
        label->setPalette(readable);
}

void CColorPicker::changeEvent(QEvent* event) {
    if (event->type() == QEvent::PaletteChange)
        colorLabels();
    QWidget::changeEvent(event);
}

void CColorPicker::mousePressEvent(QMouseEvent*) {
    mPopup->move(mapToGlobal(QPoint(kPopupShift, 0)));
    mPopup->setMouseTracking(true);
    mPopup->show();
}

void CColorPicker::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    const QRectF swatch(kSwatchLeft, 0, width() - kSwatchLeft, kSwatchHeight);
    painter.fillRect(CrispPaint::onGrid(painter, swatch), mColor);
    CrispPaint::frame(painter, swatch, Qt::black);
}
