#include "GUI/Panes/CWgtPaneGenericImpl.h"

#include "Core/CThreadedCore_Orvela.h"
#include "GUI/Controls/CColorPicker.h"

using namespace orvela;

namespace {

constexpr int kSliderWidth = 240; // pixels

} // namespace

CWgtPaneGenericImpl::CWgtPaneGenericImpl(QWidget* owner, EGUIMode mode)
    : IWgtPane(owner, mode), mSlider(SliderTable::single(mode)) {
    setupUi(this);
    sldrGeneric->setFixedWidth(kSliderWidth);
    const CUserParamsPhotoshop factory(mode);
    if (mSlider)
        setUpSliders({mSlider, 1}, factory.mSliderParams);
    if (mode == Mode_ColorFilter)
        addColorPicker(factory.mSliderParams);
}

void CWgtPaneGenericImpl::addColorPicker(const CSliderParams& settings) {
    mPicker = new CColorPicker(this);
    mPicker->setObjectName(QStringLiteral("colrPickGeneric"));
    mPicker->setAccessibleName(tr(mSlider->label));
    setUpColorPicker(mPicker, sldrGeneric);
    mPicker->setColor(filterColor(settings));
    verticalLayout->insertWidget(1, mPicker, 0, Qt::AlignRight);
}

void CWgtPaneGenericImpl::applyGUIParams(CUserParams& params) {
    CSliderParams& settings = params.mSliderParams;
    if (mSlider)
        settings.*mSlider->value = static_cast<float>(sldrGeneric->value());
    if (mPicker)
        writeColor(mPicker, settings.mColor_Value_R, settings.mColor_Value_G, settings.mColor_Value_B);
}

CThreadedCore* CWgtPaneGenericImpl::createCore(CARGBPlane* inPlane, CARGBPlane* outPlane, QObject* owner) {
    return new CThreadedCore_Orvela(inPlane, outPlane, owner);
}
