#pragma once

#include <QWidget>

class CColorPickerPopup;
class QBoxLayout;
class QLabel;
class QLineEdit;

/// A colour swatch of 100 x 14 pixels with a field for each of red, green and blue (0 to 255) on it. Pressing
/// the mouse on it, Space or Return opens a colour field to choose from, which goes when the picker hides or
/// is disabled.
class CColorPicker : public QWidget {
    Q_OBJECT

public:
    /// Where the swatch begins in the control.
    static constexpr int kSwatchLeft = 2;

    /// Opaque white.
    explicit CColorPicker(QWidget* parent = nullptr);

    QColor color() const { return mColor; }

public Q_SLOTS:
    /// Takes and announces a colour, also when it is the current one. A colour that a receiver of
    /// colorChanged hands back unchanged is not announced again, so that two pickers may follow each other.
    void setColor(QColor NewColor);
    void on_redValue_changed(const QString& text);
    void on_greenValue_changed(const QString& text);
    void on_blueValue_changed(const QString& text);

Q_SIGNALS:
    void colorChanged(QColor color);

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    void changeEvent(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;

private:
    QLineEdit* addField(QBoxLayout* layout, const QString& label, const QString& object, const QString& name);
    void openField(const QPoint& pressed);
    QColor readable() const;
    void colorLabels();
    void fitToFont();
    void announce();

    QColor mColor{255, 255, 255};
    bool mAnnouncing = false;
    CColorPickerPopup* mPopup;
    QList<QLabel*> mLabels;
    QLineEdit* mRed;
    QLineEdit* mGreen;
    QLineEdit* mBlue;
};
