#pragma once

#include <QImage>
#include <QPixmap>
#include <QWidget>

/// The colour field that a colour picker opens: the pixel under the mouse is the colour chosen, and the arrow
/// keys move the choice (with Ctrl by single pixels). It closes when the mouse is released over it, unless
/// that ends the mere click that opened it, on Return and Space, and on Escape, which takes the choice back.
class CColorPickerPopup : public QWidget {
    Q_OBJECT

public:
    explicit CColorPickerPopup(QWidget* parent = nullptr);

    /// Shows the field with its upper left corner at `corner`, or as near as the screen allows, and a ring at
    /// the pixel that is closest to `color`. All points are global.
    /// @param pressed  where the mouse was pressed to open it
    void open(const QPoint& corner, const QColor& color, const QPoint& pressed);

    /// Where the ring is.
    QPoint chosen() const { return mChosen; }

Q_SIGNALS:
    /// A pixel of this colour was chosen.
    void colorChanged(QColor Color);

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    void paintEvent(QPaintEvent* event) override;

private:
    QPoint closestTo(const QColor& color) const;
    void choose(const QPoint& point);
    void takeBack();

    QImage mField;
    QPixmap mPicture; ///< of the field, as sharp as the screen
    QPoint mChosen;
    QPoint mPressed;
    bool mReleaseCloses = false;
    QColor mBefore;
    QColor mColor;
};
