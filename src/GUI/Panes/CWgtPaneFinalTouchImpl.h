#pragma once

#include "GUI/Panes/IWgtPane.h"
#include "GUI/forms/ui_CWgtPaneFinalTouch.h"

/// The pane of Final Touch: levels for each channel, contrast, brightness and a colour filter on the
/// processed image, each in a perceptual and an absolute form. Both forms of the colour filter are one
/// setting.
class CWgtPaneFinalTouchImpl final : public IWgtPane, public Ui::CWgtPaneFinalTouch {
    Q_OBJECT

public:
    /// Every slider is off and at its neutral position.
    CWgtPaneFinalTouchImpl(QWidget* owner, EGUIMode mode);

    void applyGUIParams(CUserParams& params) override;
    void writeSettings(CSliderParams& settings) const override;
    CThreadedCore* createCore(CARGBPlane* inPlane, CARGBPlane* outPlane, QObject* owner) override;
    void fillPresetList(QComboBox* list) override;

public Q_SLOTS:
    void on_btnBack_clicked();

protected:
    void doSetSliders(const QString& presetName) override;

private:
    void nameTabs();
    void mirrorColorFilters();
};
