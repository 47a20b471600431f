#include "GUI/Panes/CWgtPaneAdvancedImpl.h"

#include "Core/CThreadedCore_Orvela.h"
#include "Settings/FactoryPresets.h"
#include "Utility/Logger.h"

#include <QMouseEvent>

using namespace orvela;

CWgtPaneAdvancedImpl::CWgtPaneAdvancedImpl(QWidget* owner, EGUIMode mode) : IWgtPane(owner, mode) {
    mShowsPresets = true;
    setupUi(this);
    sldrAutoContrast->hide();
    setUpSliders(PaneTable::sliders(Mode_Advanced), CSliderParams());
    setUpColorPicker(colrPickAutoColor, PaneTable::colors(Mode_Advanced).front(), sldrColorFilter);
    lblExtendedSettings->installEventFilter(this);
    lblExtendedSettings->setCursor(Qt::PointingHandCursor);
    extendSettings(false);
}

void CWgtPaneAdvancedImpl::doSetSliders(const QString& presetName) {
    const CUserParamsPhotoshop factory(FactoryPresets::factoryPresetMode(presetName));
    setUpSliders(PaneTable::sliders(Mode_Advanced), factory.mSliderParams);
    showColors(PaneTable::colors(Mode_Advanced), factory.mSliderParams);
}

void CWgtPaneAdvancedImpl::writeSettings(CSliderParams& settings) const {
    writeSliders(PaneTable::sliders(Mode_Advanced), settings);
    writeColors(PaneTable::colors(Mode_Advanced), settings);
}

void CWgtPaneAdvancedImpl::applyGUIParams(CUserParams& params) {
    writeSettings(params.mSliderParams);
    Log::log(LogLevel::Debug, "CWgtPaneAdvancedImpl::applyGUIParams");
    params.list(QStringLiteral("CWgtPaneAdvancedImpl::applyGUIParams"));
    Log::log(LogLevel::Debug, "CWgtPaneAdvancedImpl::applyGUIParams finished.");
}

CThreadedCore* CWgtPaneAdvancedImpl::createCore(CARGBPlane* inPlane, CARGBPlane* outPlane, QObject* owner) {
    auto* core = new CThreadedCore_Orvela(inPlane, outPlane, owner);
    enableAfterRuns(btnFinalTouch, core);
    return core;
}

void CWgtPaneAdvancedImpl::on_btnFinalTouch_clicked() {
    Q_EMIT changeMode(Mode_FinalTouch);
}

void CWgtPaneAdvancedImpl::on_btnExtendSettings_clicked() {
    extendSettings(true);
}

void CWgtPaneAdvancedImpl::on_btnCollapseSettings_clicked() {
    extendSettings(false);
}

// A click on the text does what one on the button before it does.
bool CWgtPaneAdvancedImpl::eventFilter(QObject* watched, QEvent* event) {
    if (watched == lblExtendedSettings && event->type() == QEvent::MouseButtonPress && isEnabled() &&
        static_cast<QMouseEvent*>(event)->button() == Qt::LeftButton)
        extendSettings(btnCollapseSettings->isHidden());
    return IWgtPane::eventFilter(watched, event);
}

void CWgtPaneAdvancedImpl::extendSettings(bool extended) {
    QToolButton* const gone = extended ? btnExtendSettings : btnCollapseSettings;
    QToolButton* const shown = extended ? btnCollapseSettings : btnExtendSettings;
    shown->show();
    if (gone->hasFocus())
        shown->setFocus(Qt::OtherFocusReason);
    gone->hide();
    for (QGroupBox* group : {grpBxPerceptualAbsolute, grpBxArtefacts, grpBxColor})
        group->setVisible(extended);
}
