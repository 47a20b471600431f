#include "command/SettingOptions.h"

#include "Settings/SettingFields.h"
#include "Settings/SliderTable.h"
#include "command/ExitStatus.h"
#include "command/ModeNames.h"
#include "command/TextValues.h"

#include <algorithm>
#include <cstring>

namespace orvela {

namespace {

using TextValues::joined;

const ModeDescription& modeFor(const SettingOptions& options) {
    if (!options.mode)
        return *ModeTable::find(options.preset ? Mode_Advanced : Mode_Automatic);
    if (const ModeDescription* mode = ModeNames::find(*options.mode))
        return *mode;
    throw UsageError("unknown mode \"" + *options.mode + "\"; did you mean " +
                     joined(ModeNames::nearest(*options.mode), " or ") + "? `orvela modes` lists all");
}

// Switches the slider on at the shown number.
void setShown(CSliderParams& sliders, const SliderDescription& slider, const std::string& option,
              const std::string& text) {
    const double low = std::min(slider.low, slider.high);
    const double high = std::max(slider.low, slider.high);
    const double shown = TextValues::number(option, text, low, high);
    sliders.*slider.value = static_cast<float>(std::clamp(slider.scale->toPosition(shown), 0.0, 1000.0));
    sliders.*slider.enabled = true;
}

void applyValue(CSliderParams& sliders, const ModeDescription& mode, const std::string& text) {
    const SliderDescription* slider = SliderTable::single(mode.mode);
    if (!slider)
        throw UsageError(std::string("--value is for modes with one slider; ") + mode.displayName +
                         " is none (see `orvela modes`)");
    setShown(sliders, *slider, std::string("--value (") + slider->label + ")", text);
}

void applyLabelled(CSliderParams& sliders, const ModeDescription& mode, const std::string& label,
                   const std::string& text) {
    const std::string option = "--" + ModeNames::plain(label);
    std::vector<std::string> known;
    for (const SliderDescription& slider : SliderTable::threeSliders(mode.mode)) {
        if (label == slider.label)
            return setShown(sliders, slider, option, text);
        known.push_back("--" + ModeNames::plain(slider.label));
    }
    throw UsageError(option + " is no slider of " + mode.displayName +
                     (known.empty() ? " (see `orvela modes`)" : ", which has " + joined(known, ", ")));
}

void applyColor(CSliderParams& sliders, const std::string& text) {
    const std::vector<std::string> parts = TextValues::split(text, ',');
    if (parts.size() != 3)
        throw UsageError("--colour " + text + ": three numbers from 0 to 255 are needed, such as 0,255,0");
    using P = CSliderParams;
    constexpr float P::*kFilter[] = {&P::mColor_Value_R, &P::mColor_Value_G, &P::mColor_Value_B};
    constexpr float P::*kTouch[] = {&P::mColor_Touch_Value_R, &P::mColor_Touch_Value_G,
                                    &P::mColor_Touch_Value_B};
    for (std::size_t i = 0; i < parts.size(); ++i) {
        const auto component = static_cast<float>(TextValues::wholeNumber("--colour", parts[i], 0, 255));
        sliders.*kFilter[i] = component;
        sliders.*kTouch[i] = component;
    }
}

// NAME=POSITION, NAME=POSITION,on|off or, for a switch, NAME=on|off.
void applyField(CSliderParams& sliders, const std::string& text) {
    const auto [name, given] = TextValues::assignment("--set", text);
    const SliderField* field = SettingFields::find(name);
    if (!field)
        throw UsageError("--set " + text + ": there is no setting \"" + name +
                         "\"; --save-preset writes a file with all names");
    if (field->flag) {
        sliders.*field->flag = TextValues::onOrOff("--set " + name, given);
        return;
    }
    const std::size_t comma = given.find(',');
    sliders.*field->value = static_cast<float>(
        TextValues::number("--set " + name, given.substr(0, comma), 0, SettingFields::highest(*field)));
    if (comma == std::string::npos)
        return;
    bool CSliderParams::*enabled = SettingFields::switchOf(*field);
    if (!enabled)
        throw UsageError("--set " + text + ": " + name + " has no switch");
    sliders.*enabled = TextValues::onOrOff("--set " + name, given.substr(comma + 1));
}

// The slider's name in options: its object name without the prefix.
std::string touchName(const SliderDescription& slider) {
    return slider.object + std::strlen("sldr");
}

void applyFinalTouch(CSliderParams& sliders, const std::string& text) {
    for (const std::string& part : TextValues::split(text, ',')) {
        auto [name, given] = TextValues::assignment("--final-touch", part);
        // The perceptual colour filter mirrors the absolute one, which alone has fields.
        const std::string wanted = name == "PercColorFilter" ? "AbsColorFilter" : name;
        std::vector<std::string> known;
        const SliderDescription* found = nullptr;
        for (const SliderDescription& slider : SliderTable::finalTouch()) {
            known.push_back(touchName(slider));
            if (known.back() == wanted)
                found = &slider;
        }
        if (!found)
            throw UsageError("--final-touch: there is no slider \"" + name + "\"; there are " +
                             joined(known, ", "));
        setShown(sliders, *found, "--final-touch " + name, given);
    }
}

void checkColorIsUsed(const SettingOptions& options, const CSliderParams& sliders) {
    if (options.color && !sliders.mColor_Effect_Intensity_Enabled && !sliders.mColor_Touch_Enabled)
        throw UsageError("--colour needs a colour filter: --mode \"Color Filter\" --value, or "
                         "--final-touch AbsColorFilter=VALUE");
}

void checkSomethingIsSet(const SettingOptions& options, const ModeDescription& mode) {
    std::vector<std::string> sliders;
    for (const SliderDescription& slider : SliderTable::threeSliders(mode.mode))
        sliders.push_back("--" + ModeNames::plain(slider.label));
    if (!sliders.empty() && options.labelled.empty() && options.fields.empty() && !options.preset &&
        !options.finalTouch)
        throw UsageError(std::string(mode.displayName) + " needs at least one of " + joined(sliders, ", "));
}

void applyPreset(RunSettings& run, CSliderParams& sliders, const std::string& path) {
    run.preset = PresetFile::read(QString::fromLocal8Bit(path.c_str()));
    run.preset.applyTo(sliders);
    for (const QString& name : run.preset.unknownNames())
        run.notes.push_back(path + ": unknown setting " + name.toStdString() + " is kept but has no effect");
}

} // namespace

std::vector<std::string> labelsOfThreeSliders() {
    std::vector<std::string> labels;
    for (const EGUIMode mode : {Mode_Adjustments, Mode_SmartLevels})
        for (const SliderDescription& slider : SliderTable::threeSliders(mode))
            if (std::find(labels.begin(), labels.end(), slider.label) == labels.end())
                labels.emplace_back(slider.label);
    return labels;
}

RunSettings settle(const SettingOptions& options) {
    const ModeDescription& mode = modeFor(options);
    checkSomethingIsSet(options, mode);
    RunSettings run;
    run.params = CUserParamsPhotoshop(mode.mode);
    CSliderParams sliders = run.params.mSliderParams;
    if (options.preset)
        applyPreset(run, sliders, *options.preset);
    if (options.value)
        applyValue(sliders, mode, *options.value);
    for (const auto& [label, text] : options.labelled)
        applyLabelled(sliders, mode, label, text);
    if (options.color)
        applyColor(sliders, *options.color);
    for (const std::string& text : options.fields)
        applyField(sliders, text);
    if (options.finalTouch)
        applyFinalTouch(sliders, *options.finalTouch);
    checkColorIsUsed(options, sliders);

    run.preset.take(sliders);
    run.params.mSliderParams = SettingFields::onlyFinalTouch(sliders, false);
    run.runsFinalTouch = SettingFields::anyFinalTouchOn(sliders);
    run.finalTouchParams.mSliderParams = SettingFields::onlyFinalTouch(sliders, true);
    return run;
}

} // namespace orvela
