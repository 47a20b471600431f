#include "GUI/Panes/CWgtPane3SlidersImpl.h"

#include "Core/CThreadedCore_Orvela.h"
#include "Utility/DebugBoxes.h"
#include "Utility/Logger.h"

using namespace orvela;

CWgtPane3SlidersImpl::CWgtPane3SlidersImpl(QWidget* owner, EGUIMode mode) : IWgtPane(owner, mode) {
    setupUi(this);
    doSetSliders(QString());
}

void CWgtPane3SlidersImpl::doSetSliders(const QString&) {
    const auto sliders = PaneTable::threeSliders(mode());
    for (const PaneSlider& each : sliders) {
        setUpSlider(each, false, each.initial);
        Log::log(LogLevel::Debug, "SETUP_SLIDER_WITH_DEFVALUE%s", each.slider.label);
    }
    if (sliders.empty())
        DebugBoxes::warningBox(window(), tr("Note:"), tr("invalid mode in CWgtPane3SlidersImpl::setSliders"));
}

void CWgtPane3SlidersImpl::writeSettings(CSliderParams& settings) const {
    writeSliders(PaneTable::threeSliders(mode()), settings);
}

void CWgtPane3SlidersImpl::applyGUIParams(CUserParams& params) {
    writeSettings(params.mSliderParams);
    if (!PaneTable::threeSliders(mode()).empty())
        return;
    Log::log(LogLevel::Warning, "in CWgtPane3SlidersImpl::applyGUIParams");
    DebugBoxes::warningBox(window(), tr("Note:"), tr("invalid mode in CWgtPane3SlidersImpl::applyGUIParams"));
}

CThreadedCore* CWgtPane3SlidersImpl::createCore(CARGBPlane* inPlane, CARGBPlane* outPlane, QObject* owner) {
    return new CThreadedCore_Orvela(inPlane, outPlane, owner);
}
