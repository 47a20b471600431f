#include "GUI/Panes/IWgtPane.h"

#include "Core/CThreadedCore.h"
#include "GUI/Controls/Artwork.h"
#include "GUI/Controls/CColorPicker.h"
#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Panes/TrackZones.h"
#include "Utility/Logger.h"

using namespace orvela;

namespace {

constexpr double kMiddle = 500;

} // namespace

IWgtPane::IWgtPane(QWidget* owner, EGUIMode mode) : QWidget(owner), mOwner(owner), mMode(mode) {
    initArtwork();
}

void IWgtPane::setSliders(const QString& presetName) {
    resetSliders();
    doSetSliders(presetName);
}

void IWgtPane::doSetSliders(const QString&) {}

void IWgtPane::fillPresetList(QComboBox*) {}

void IWgtPane::resetSliders() {
    for (COrvelaSliderBlockImpl* each : findChildren<COrvelaSliderBlockImpl*>()) {
        each->setEnabled(false);
        each->setValue(kMiddle);
    }
}

COrvelaSliderBlockImpl* IWgtPane::block(const SliderDescription& slider) const {
    auto* found = findChild<COrvelaSliderBlockImpl*>(QLatin1String(slider.object));
    Q_ASSERT(found);
    return found;
}

void IWgtPane::setUpSlider(COrvelaSliderBlockImpl* block, const QString& label) {
    block->setText(label);
    block->setValue(kMiddle);
    connect(block, SIGNAL(valueChanged(double)), mOwner, SLOT(onMy_slider_valueChanged(double)));
    connect(block, SIGNAL(stateChanged(bool)), mOwner, SLOT(onMy_slider_stateChanged(bool)));
}

void IWgtPane::setUpSlider(const SliderDescription& slider, bool on, double position) {
    COrvelaSliderBlockImpl* control = block(slider);
    const QString label = tr(slider.label);
    setUpSlider(control, label);
    control->setToolTip(label);
    control->sldrValue->setToolTip(label);
    if (const QList<ZoneStop> zones = TrackZones::set(slider.zones); !zones.isEmpty())
        control->setZoneStops(zones);
    control->setEnabled(on);
    control->setScale(*slider.scale);
    control->setMinMax(slider.low, slider.high);
    control->setValue(position);
    Log::log(LogLevel::Debug, "%s", slider.label);
    Log::log(LogLevel::Debug, "Enabled:%d", on);
    Log::log(LogLevel::Debug, "Range:[%.2f,%.2f] Default:%.2f", slider.low, slider.high, slider.initial);
}

void IWgtPane::setUpSliders(std::span<const SliderDescription> sliders, const CSliderParams& settings) {
    for (const SliderDescription& slider : sliders)
        setUpSlider(slider, settings.*slider.enabled, slider.value ? settings.*slider.value : slider.initial);
}

void IWgtPane::setUpColorPicker(CColorPicker* picker, COrvelaSliderBlockImpl* slider) {
    connect(picker, SIGNAL(colorChanged(QColor)), mOwner, SLOT(onMy_colorPicker_colorChanged(QColor)));
    connect(slider, &COrvelaSliderBlockImpl::stateChanged, picker, &CColorPicker::setVisible);
    picker->setVisible(slider->isEnabled());
}

void IWgtPane::writeSliders(std::span<const SliderDescription> sliders, CSliderParams& settings) const {
    for (const SliderDescription& slider : sliders) {
        const COrvelaSliderBlockImpl* control = block(slider);
        if (slider.value)
            settings.*slider.value = static_cast<float>(control->value());
        if (slider.enabled)
            settings.*slider.enabled = control->isEnabled();
    }
}

QColor IWgtPane::filterColor(const CSliderParams& settings) {
    return QColor(int(settings.mColor_Value_R), int(settings.mColor_Value_G), int(settings.mColor_Value_B));
}

void IWgtPane::writeColor(const CColorPicker* picker, float& red, float& green, float& blue) {
    const QColor color = picker->color();
    red = static_cast<float>(color.red());
    green = static_cast<float>(color.green());
    blue = static_cast<float>(color.blue());
}

void IWgtPane::enableAfterRuns(QWidget* button, CThreadedCore* core) {
    connect(core, &CThreadedCore::started, button, [button] { button->setEnabled(false); });
    const auto ended = [button, core] { button->setEnabled(core->lastProcessingDone()); };
    connect(core, &CThreadedCore::finished, button, ended);
    connect(core, &CThreadedCore::terminated, button, ended);
}
