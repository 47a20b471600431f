#pragma once

#include <QScrollArea>

/// A scroll area that asks for the height of its content, as far as the screen has it beside the rest of a
/// window, and scrolls what it does not get. Its width has room for the scroll bar.
class CSettingsArea : public QScrollArea {
    Q_OBJECT

public:
    explicit CSettingsArea(QWidget* parent = nullptr);

    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

protected:
    bool event(QEvent* event) override;
};
