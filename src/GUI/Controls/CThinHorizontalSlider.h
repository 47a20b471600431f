#pragma once

#include "GUI/Controls/ZoneStop.h"

#include <QWidget>

#include <functional>

class QPainter;

/// A slider 7 pixels high whose track shows, by its colour, whether the value is mild, strong or extreme.
/// It takes the left mouse button and the arrow, page, home and end keys; with Ctrl a key moves a tenth. A
/// slider that is off itself is quiet, one in disabled surroundings is dimmed and looks the same otherwise.
class CThinHorizontalSlider : public QWidget {
    Q_OBJECT

public:
    /// The value that `delta` leads to from `value`; the result stays within the range.
    using Stepper = std::function<double(double value, double delta)>;

    explicit CThinHorizontalSlider(QWidget* parent = nullptr);

    double minimum() const { return mMinimum; }
    double maximum() const { return mMaximum; }
    /// The value as it was set: not limited to the range.
    double value() const { return mValue; }
    /// True from a mouse press to its release.
    bool isDragging() const { return mDragging; }

    const QList<orvela::ZoneStop>& zoneStops() const { return mStops; }
    /// @param stops  in rising order of position; fewer than two are replaced by a default when painted
    void setZoneStops(const QList<orvela::ZoneStop>& stops);

    /// Replaces how keys and wheel step; the plain addition at first.
    void setStepper(const Stepper& stepper) { mStepper = stepper; }

    /// Takes `value`, limited to the range, and announces it: what keys do.
    void moveTo(double value);
    /// Moves by so many steps of a hundredth of the range, as the stepper has it, and announces the value.
    void stepBy(double steps);

    QSize sizeHint() const override;

public Q_SLOTS:
    void setMinimum(double dNewMin);
    void setMaximum(double dNewMax);
    /// Stores the value without announcing it.
    void setValue(double dNewVal);

Q_SIGNALS:
    /// The user moved the slider.
    void valueChanged(double dValue);

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void changeEvent(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;

private:
    void handlePoint(const QPointF& point);
    void endDrag();
    void ensureStops();
    double share() const;
    bool isOn() const;
    void paintTrack(QPainter& painter) const;
    void paintHandle(QPainter& painter) const;

    double mMinimum = 0;
    double mMaximum = 1000;
    double mValue = 0;
    bool mDragging = false;
    QList<orvela::ZoneStop> mStops;
    Stepper mStepper;
};
