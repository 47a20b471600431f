#include "GUI/Panes/CWgtPaneGenericImpl.h"

#include "Core/CThreadedCore_Orvela.h"
#include "GUI/Controls/CColorPicker.h"

using namespace orvela;

namespace {

constexpr int kSliderWidth = 240; // pixels

} // namespace

CWgtPaneGenericImpl::CWgtPaneGenericImpl(QWidget* owner, EGUIMode mode)
    : IWgtPane(owner, mode), mSlider(PaneTable::single(mode)) {
    setupUi(this);
    sldrGeneric->setFixedWidth(kSliderWidth);
    const CUserParamsPhotoshop factory(mode);
    if (!mSlider)
        return;
    setUpSliders({mSlider, 1}, factory.mSliderParams);
    mColors = PaneTable::colors(mode);
    for (const PaneColor& color : mColors)
        addColorPicker(color);
    showColors(mColors, factory.mSliderParams);
}

void CWgtPaneGenericImpl::addColorPicker(const PaneColor& color) {
    auto* picker = new CColorPicker(frmSliders);
    picker->setObjectName(QLatin1String(color.object));
    setUpColorPicker(picker, color, sldrGeneric);
}

void CWgtPaneGenericImpl::writeSettings(CSliderParams& settings) const {
    if (mSlider)
        settings.*mSlider->slider.value = static_cast<float>(sldrGeneric->exactValue());
    writeColors(mColors, settings);
}

CThreadedCore* CWgtPaneGenericImpl::createCore(CARGBPlane* inPlane, CARGBPlane* outPlane, QObject* owner) {
    return new CThreadedCore_Orvela(inPlane, outPlane, owner);
}
