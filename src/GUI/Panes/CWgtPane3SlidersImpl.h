#pragma once

#include "GUI/Panes/IWgtPane.h"
#include "GUI/forms/ui_CWgtPane3Sliders.h"

/// The pane of Smart Levels and Adjustments.
class CWgtPane3SlidersImpl final : public IWgtPane, public Ui::CWgtPane3Sliders {
    Q_OBJECT

public:
    /// Every slider is off and at its initial position. Any other mode gives a message box, and sliders that
    /// drive nothing.
    CWgtPane3SlidersImpl(QWidget* owner, EGUIMode mode);

    /// A message box when the mode is not one of the two.
    void applyGUIParams(CUserParams& params) override;
    void writeSettings(CSliderParams& settings) const override;
    CThreadedCore* createCore(CARGBPlane* inPlane, CARGBPlane* outPlane, QObject* owner) override;

protected:
    void doSetSliders(const QString& presetName) override;
};
