#pragma once

#include "GUI/Panes/IWgtPane.h"
#include "GUI/forms/ui_CWgtPaneGeneric.h"

/// The pane of the modes with a single filter (17 to 30): its slider, for the colour filter with a picker.
class CWgtPaneGenericImpl final : public IWgtPane, public Ui::CWgtPaneGeneric {
    Q_OBJECT

public:
    /// The slider is on and at the mode's position. For a mode with no slider of its own it drives nothing.
    CWgtPaneGenericImpl(QWidget* owner, EGUIMode mode);

    /// Writes the position and the colour; the mode's parameters have the filter switched on.
    void writeSettings(CSliderParams& settings) const override;
    CThreadedCore* createCore(CARGBPlane* inPlane, CARGBPlane* outPlane, QObject* owner) override;

private:
    void addColorPicker(const orvela::PaneColor& color);

    const orvela::PaneSlider* mSlider;
    std::span<const orvela::PaneColor> mColors; ///< none without a slider
};
