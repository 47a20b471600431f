#include "GUI/Controls/CColorPickerPopup.h"

#include "GUI/Controls/Artwork.h"
#include "GUI/Controls/ControlAccessibility.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>
#include <QPixmap>

using namespace orvela;

namespace {

QString fieldPath() {
    return QStringLiteral(":/Advanced UI/Misc_ColorPicker.png");
}

} // namespace

CColorPickerPopup::CColorPickerPopup(QWidget* parent) : QWidget(parent, Qt::Popup) {
    installControlAccessibility();
    initArtwork();
    mField.load(fieldPath());
    setFixedSize(mField.size());
    setCursor(Qt::CrossCursor);
    setAccessibleName(tr("Color field"));
}

void CColorPickerPopup::mouseMoveEvent(QMouseEvent* event) {
    const QPoint point = event->position().toPoint();
    if (mField.valid(point))
        Q_EMIT colorChanged(mField.pixelColor(point));
}

void CColorPickerPopup::mouseReleaseEvent(QMouseEvent* event) {
    if (rect().contains(event->position().toPoint()))
        hide();
}

void CColorPickerPopup::keyPressEvent(QKeyEvent* event) {
    if (event->key() == Qt::Key_Escape)
        hide();
    else
        QWidget::keyPressEvent(event);
}

void CColorPickerPopup::hideEvent(QHideEvent* event) {
    setMouseTracking(false);
    QWidget::hideEvent(event);
}

void CColorPickerPopup::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.drawPixmap(rect(), QPixmap(fieldPath()));
}
