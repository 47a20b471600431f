#pragma once

#include "GUI/Controls/ZoneStop.h"
#include "GUI/forms/ui_COrvelaSliderBlock.h"
#include "Settings/SliderScale.h"

#include <QWidget>

class CDoubleValidator_FixUp;

/// One setting: a label, a thin slider with positions 0 to 1000 and a text field with the number shown for
/// the position. A double click switches the setting on or off. The whole height of the row takes the mouse
/// for the slider.
class COrvelaSliderBlockImpl : public QWidget, public Ui::COrvelaSliderBlock {
    Q_OBJECT

public:
    explicit COrvelaSliderBlockImpl(QWidget* parent = nullptr);

    /// The position. Follows what is typed, also out of 0 to 1000, until editing finishes.
    double value() const;

    /// Whether the setting is on, independent of whether the surroundings are enabled.
    bool isEnabled() const;

    /// The map between position and shown number; both are the same until set. Shows nothing anew.
    void setScale(const orvela::SliderScale& scale) { mScale = scale; }

    const QList<orvela::ZoneStop>& zoneStops() const;
    /// Colours of the track, in rising order of position.
    void setZoneStops(const QList<orvela::ZoneStop>& stops);

public Q_SLOTS:
    void on_sldrValue_valueChanged(double position);
    void on_txtValue_editingFinished();
    void on_txtValue_textChanged(const QString& text);
    /// The shown range, either end first; limits what may stay in the text field.
    void setMinMax(double newMin, double newMax);
    /// Takes a shown number.
    void setVirtualValue(double NewVal);
    /// Takes a position; the text field's one decimal may move it to the nearest position it can tell.
    void setValue(double NewVal);
    /// Switches the setting on or off; the label stays as it is.
    void setEnabled(bool isEnabled);
    /// Names the setting.
    void setText(const QString& NewName);
    /// Says what the setting does: the slider's tool tip, the help on the whole row, the description for
    /// screen readers.
    void setHelp(const QString& help);

Q_SIGNALS:
    /// The position changed and the slider is not being dragged.
    void valueChanged(double Value);
    /// The setting was switched on or off.
    void stateChanged(bool IsEnabled);

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    double stepped(double position, double delta) const;
    void forwardToSlider(QMouseEvent* event);
    void fitToFont();
    void fitToPalette();

    orvela::SliderScale mScale;
    CDoubleValidator_FixUp* mValidator;
};
