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
        addColorPicker(color.object);
    showColors(mColors, factory.mSliderParams);
}

void CWgtPaneGenericImpl::addColorPicker(const char* object) {
    auto* picker = new CColorPicker(this);
    picker->setObjectName(QLatin1String(object));
    picker->setAccessibleName(tr(mSlider->slider.label));
    setUpColorPicker(picker, sldrGeneric);
    verticalLayout->insertWidget(1, picker, 0, Qt::AlignRight);
}

void CWgtPaneGenericImpl::applyGUIParams(CUserParams& params) {
    CSliderParams& settings = params.mSliderParams;
    if (mSlider)
        settings.*mSlider->slider.value = static_cast<float>(sldrGeneric->value());
    writeColors(mColors, settings);
}

CThreadedCore* CWgtPaneGenericImpl::createCore(CARGBPlane* inPlane, CARGBPlane* outPlane, QObject* owner) {
    return new CThreadedCore_Orvela(inPlane, outPlane, owner);
}
