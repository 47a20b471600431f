#pragma once

#include <QImage>
#include <QWidget>

/// The colour field that a colour picker opens: the pixel under the mouse is the colour chosen. Hides when
/// the mouse is released over it or Escape is pressed.
class CColorPickerPopup : public QWidget {
    Q_OBJECT

public:
    explicit CColorPickerPopup(QWidget* parent = nullptr);

Q_SIGNALS:
    /// The mouse is over a pixel of this colour.
    void colorChanged(QColor Color);

protected:
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    void paintEvent(QPaintEvent* event) override;

private:
    QImage mField;
};
