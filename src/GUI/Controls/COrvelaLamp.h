#pragma once

#include <QAbstractButton>

/// The switch of a setting: a lamp that is lit while the setting is on. A click, a double click or Space
/// switches it once.
class COrvelaLamp : public QAbstractButton {
    Q_OBJECT

public:
    explicit COrvelaLamp(QWidget* parent = nullptr);

    QSize sizeHint() const override;

protected:
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
};
