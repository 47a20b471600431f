#pragma once

#include "GUI/Panes/IWgtPane.h"
#include "GUI/forms/ui_CWgtPaneAdvanced.h"

/// The pane of Advanced mode and of every automatic mode: all sliders of the main pipeline.
class CWgtPaneAdvancedImpl final : public IWgtPane, public Ui::CWgtPaneAdvanced {
    Q_OBJECT

public:
    /// Every slider is off and at its initial position; the rarely used groups are folded away.
    CWgtPaneAdvancedImpl(QWidget* owner, EGUIMode mode);

    void applyGUIParams(CUserParams& params) override;
    void writeSettings(CSliderParams& settings) const override;
    CThreadedCore* createCore(CARGBPlane* inPlane, CARGBPlane* outPlane, QObject* owner) override;

public Q_SLOTS:
    void on_btnFinalTouch_clicked();
    void on_btnExtendSettings_clicked();
    void on_btnCollapseSettings_clicked();

protected:
    void doSetSliders(const QString& presetName) override;
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void extendSettings(bool extended);
};
