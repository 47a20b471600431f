#include "GUI/Panes/CWgtPaneFinalTouchImpl.h"

#include "Core/CThreadedCore_FinalTouch.h"
#include "Utility/Logger.h"

#include <QComboBox>
#include <QTabBar>

using namespace orvela;

namespace {

// A block that already has the position keeps the text that is being typed.
void mirror(COrvelaSliderBlockImpl* source, COrvelaSliderBlockImpl* target) {
    QObject::connect(source, &COrvelaSliderBlockImpl::valueChanged, target, [source, target] {
        if (target->exactValue() != source->exactValue())
            target->setValue(source->exactValue());
    });
    QObject::connect(source, &COrvelaSliderBlockImpl::stateChanged, target,
                     &COrvelaSliderBlockImpl::setEnabled);
}

} // namespace

CWgtPaneFinalTouchImpl::CWgtPaneFinalTouchImpl(QWidget* owner, EGUIMode mode) : IWgtPane(owner, mode) {
    mAutoRefresh = true;
    mTakesProcessedImage = true;
    setupUi(this);
    nameTabs();
    mirrorColorFilters();
    doSetSliders(QString());
    const PaneColor& color = PaneTable::colors(Mode_FinalTouch).front();
    setUpColorPicker(colrPickPercColorFilter, color, sldrPercColorFilter);
    setUpColorPicker(colrPickAbsColorFilter, color, sldrAbsColorFilter);
}

// The tabs of the channels show no text.
void CWgtPaneFinalTouchImpl::nameTabs() {
    for (QTabWidget* channels : {tabCtnrPercRGB, tabCtnrAbsRGB})
        for (int tab = 0; tab < channels->count(); ++tab)
            channels->tabBar()->setAccessibleTabName(tab, channels->tabToolTip(tab));
}

void CWgtPaneFinalTouchImpl::mirrorColorFilters() {
    mirror(sldrPercColorFilter, sldrAbsColorFilter);
    mirror(sldrAbsColorFilter, sldrPercColorFilter);
    connect(colrPickPercColorFilter, &CColorPicker::colorChanged, colrPickAbsColorFilter,
            &CColorPicker::setColor);
    connect(colrPickAbsColorFilter, &CColorPicker::colorChanged, colrPickPercColorFilter,
            &CColorPicker::setColor);
}

void CWgtPaneFinalTouchImpl::doSetSliders(const QString&) {
    for (const PaneSlider& slider : PaneTable::sliders(Mode_FinalTouch))
        setUpSlider(slider, false, slider.initial);
}

void CWgtPaneFinalTouchImpl::writeSettings(CSliderParams& settings) const {
    writeSliders(PaneTable::sliders(Mode_FinalTouch), settings);
    writeColors(PaneTable::colors(Mode_FinalTouch), settings);
}

void CWgtPaneFinalTouchImpl::applyGUIParams(CUserParams& params) {
    writeSettings(params.mSliderParams);
    Log::log(LogLevel::Debug, "TMP: params.mSliderParams.mColor_Touch_Enabled %d.",
             params.mSliderParams.mColor_Touch_Enabled);
}

CThreadedCore* CWgtPaneFinalTouchImpl::createCore(CARGBPlane* inPlane, CARGBPlane* outPlane, QObject* owner) {
    auto* core = new CThreadedCore_FinalTouch(inPlane, outPlane, owner);
    enableAfterRuns(btnBack, core);
    return core;
}

void CWgtPaneFinalTouchImpl::fillPresetList(QComboBox* list) {
    list->addItem(QIcon(QStringLiteral(":/Mode_Automatic.png")), tr("Automatic"));
}

void CWgtPaneFinalTouchImpl::on_btnBack_clicked() {
    Q_EMIT changeMode(Mode_Advanced);
}
