#include "GUI/Panes/IWgtPane.h"

#include "Core/CThreadedCore.h"
#include "GUI/Controls/Artwork.h"
#include "GUI/Controls/CColorPicker.h"
#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Panes/TrackZones.h"
#include "Utility/CGenericEx.h"
#include "Utility/Logger.h"

#include <QBoxLayout>
#include <QCoreApplication>
#include <QEvent>

#include <algorithm>

using namespace orvela;

namespace {

constexpr double kMiddle = 500;

QString shown(const char* textOfTable) {
    return QCoreApplication::translate("SliderTable", textOfTable);
}

// The control of the pane's form with that object name.
template <class Control>
Control* controlOf(const IWgtPane& pane, const char* object) {
    if (auto* found = pane.findChild<Control*>(QLatin1String(object)))
        return found;
    throw CGenericEx(QStringLiteral("The form of %1 has no control %2.")
                         .arg(QLatin1String(pane.metaObject()->className()), QLatin1String(object)),
                     "IWgtPane.cpp", __LINE__);
}

} // namespace

IWgtPane::IWgtPane(QWidget* owner, EGUIMode mode) : QWidget(owner), mMode(mode) {
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

bool IWgtPane::event(QEvent* event) {
    if (event->type() == QEvent::Polish || event->type() == QEvent::FontChange)
        alignColumns();
    return QWidget::event(event);
}

// Labels of one width let all sliders begin in one column, and the pickers below them.
void IWgtPane::alignColumns() {
    const auto blocks = findChildren<COrvelaSliderBlockImpl*>();
    int width = 0;
    for (const COrvelaSliderBlockImpl* each : blocks)
        width = std::max(width, each->labelWidth());
    for (COrvelaSliderBlockImpl* each : blocks)
        each->setLabelWidth(width);
    for (const auto& [row, slider] : mPickerRows)
        row->setContentsMargins(slider->sliderLeft() - CColorPicker::kSwatchLeft, 0, 0, 0);
}

COrvelaSliderBlockImpl* IWgtPane::block(const PaneSlider& slider) const {
    return controlOf<COrvelaSliderBlockImpl>(*this, slider.object);
}

CColorPicker* IWgtPane::picker(const PaneColor& color) const {
    return controlOf<CColorPicker>(*this, color.object);
}

void IWgtPane::setUpSlider(COrvelaSliderBlockImpl* block, const QString& label) {
    block->setText(label);
    block->setValue(kMiddle);
}

void IWgtPane::setUpSlider(const PaneSlider& slider, bool on, double position) {
    const auto& [value, enabled, label, scale, stage, zones, help] = slider.slider;
    COrvelaSliderBlockImpl* control = block(slider);
    setUpSlider(control, shown(label));
    control->setToolTip(shown(label));
    control->setHelp(shown(help));
    control->setZoneStops(TrackZones::set(slider.zones()));
    control->setEnabled(on);
    control->setScale(*scale);
    control->setMinMax(scale->low(), scale->high());
    control->setValue(position);
    Log::log(LogLevel::Debug, "%s", label);
    Log::log(LogLevel::Debug, "Enabled:%d", on);
    Log::log(LogLevel::Debug, "Range:[%.2f,%.2f] Default:%.2f", scale->low(), scale->high(), slider.initial);
}

void IWgtPane::setUpSliders(std::span<const PaneSlider> sliders, const CSliderParams& settings) {
    for (const PaneSlider& each : sliders)
        setUpSlider(each, settings.*each.slider.enabled,
                    each.slider.value ? settings.*each.slider.value : each.initial);
}

void IWgtPane::setUpColorPicker(CColorPicker* picker, const PaneColor& color,
                                COrvelaSliderBlockImpl* slider) {
    const QString help = shown(color.color.help);
    picker->setToolTip(help);
    picker->setWhatsThis(help);
    picker->setAccessibleDescription(help);
    picker->setAccessibleName(slider->lblName->text());
    auto* column = qobject_cast<QBoxLayout*>(slider->parentWidget()->layout());
    column->removeWidget(picker);
    auto* row = new QHBoxLayout;
    row->addWidget(picker, 0, Qt::AlignLeft);
    column->insertLayout(column->indexOf(slider) + 1, row);
    mPickerRows.append({row, slider});
    connect(slider, &COrvelaSliderBlockImpl::stateChanged, picker, &CColorPicker::setVisible);
    picker->setVisible(slider->isEnabled());
}

void IWgtPane::showColors(std::span<const PaneColor> colors, const CSliderParams& settings) {
    for (const PaneColor& each : colors) {
        const auto& [red, green, blue] = each.color.parts;
        picker(each)->setColor(QColor(int(settings.*red), int(settings.*green), int(settings.*blue)));
    }
}

void IWgtPane::writeSliders(std::span<const PaneSlider> sliders, CSliderParams& settings) const {
    for (const PaneSlider& each : sliders) {
        if (each.mirror)
            continue;
        const COrvelaSliderBlockImpl* control = block(each);
        if (each.slider.value)
            settings.*each.slider.value = static_cast<float>(control->exactValue());
        settings.*each.slider.enabled = control->isEnabled();
    }
}

void IWgtPane::writeColors(std::span<const PaneColor> colors, CSliderParams& settings) const {
    for (const PaneColor& each : colors) {
        const QColor color = picker(each)->color();
        const auto& [red, green, blue] = each.color.parts;
        settings.*red = static_cast<float>(color.red());
        settings.*green = static_cast<float>(color.green());
        settings.*blue = static_cast<float>(color.blue());
    }
}

void IWgtPane::enableAfterRuns(QWidget* button, CThreadedCore* core) {
    connect(core, &CThreadedCore::started, button, [button] { button->setEnabled(false); });
    const auto ended = [button, core] { button->setEnabled(core->lastProcessingDone()); };
    connect(core, &CThreadedCore::finished, button, ended);
    connect(core, &CThreadedCore::terminated, button, ended);
}
