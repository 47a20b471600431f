#pragma once

#include "GUI/Controls/ZoneStop.h"
#include "GUI/forms/ui_COrvelaSliderBlock.h"
#include "Settings/SliderScale.h"

#include <QWidget>

#include <optional>

class CDoubleValidator_FixUp;

/// One setting: a lamp that is lit while the setting is on, a label, a thin slider with positions 0 to 1000
/// and a text field with the number shown for the position. The lamp and a double click anywhere switch the
/// setting on or off. The whole height of the row takes the mouse for the slider, and the wheel while the
/// focus is in the row. Up and Down step the shown number, Ctrl makes keys and wheel ten times finer.
class COrvelaSliderBlockImpl : public QWidget, public Ui::COrvelaSliderBlock {
    Q_OBJECT

public:
    explicit COrvelaSliderBlockImpl(QWidget* parent = nullptr);

    /// The position. Follows what is typed, also out of 0 to 1000, until editing finishes.
    double value() const;

    /// The position for runs and presets, 0 to 1000: the very one that setValue() or setVirtualValue() gave
    /// as long as the slider stands where it came to stand by it, else value().
    double exactValue() const;

    /// Whether the setting is on, independent of whether the surroundings are enabled.
    bool isEnabled() const;

    /// The map between position and shown number; both are the same until set. Shows nothing anew.
    void setScale(const orvela::SliderScale& scale) { mScale = scale; }

    const QList<orvela::ZoneStop>& zoneStops() const;
    /// Colours of the track, in rising order of position.
    void setZoneStops(const QList<orvela::ZoneStop>& stops);

    /// The width that the label needs for its text.
    int labelWidth() const;
    /// The width that the label has, so that the sliders of several blocks stand in one column.
    void setLabelWidth(int width);
    /// Where the slider begins once the label has its width.
    int sliderLeft() const;

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
    /// Says what the setting does: the tool tip of label, slider and number, the help on the whole row, the
    /// description for screen readers.
    void setHelp(const QString& help);

Q_SIGNALS:
    /// The position changed; while the slider is dragged only its release tells.
    void valueChanged(double Value);
    /// The setting was switched on or off.
    void stateChanged(bool IsEnabled);

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void changeEvent(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;

private:
    double stepped(double position, double delta) const;
    bool stepNumber(const QKeyEvent& event);
    bool switchByDoubleClick(const QMouseEvent& event);
    void notePress(const QObject* pressed, const QMouseEvent& event);
    void forwardToSlider(QMouseEvent* event);
    void fitToFont();
    void fitToPalette();

    orvela::SliderScale mScale;
    CDoubleValidator_FixUp* mValidator;
    double mGiven = 0;                  ///< the position or that of the number that was last set
    std::optional<double> mBeforePress; ///< the position that a press on the slider may have moved
    double mWheelRest = 0;              ///< notches, less than one
};
