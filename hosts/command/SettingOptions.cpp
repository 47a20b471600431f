#include "command/SettingOptions.h"

#include "Settings/PaneTable.h"
#include "Settings/SettingFields.h"
#include "command/ExitStatus.h"
#include "command/ModeNames.h"
#include "command/TextValues.h"

#include <algorithm>

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
    const auto [low, high] = std::minmax({slider.scale->low(), slider.scale->high()});
    const double shown = TextValues::number(option, text, low, high);
    sliders.*slider.value = static_cast<float>(std::clamp(slider.scale->toPosition(shown), 0.0, 1000.0));
    sliders.*slider.enabled = true;
}

void applyValue(CSliderParams& sliders, const ModeDescription& mode, const std::string& text) {
    const PaneSlider* single = PaneTable::single(mode.mode);
    if (!single)
        throw UsageError(std::string("--value is for modes with one slider; ") + mode.displayName +
                         " is none (see `orvela modes`)");
    setShown(sliders, single->slider, std::string("--value (") + single->slider.label + ")", text);
}

std::vector<std::string> namesOf(const std::vector<NamedSlider>& sliders) {
    std::vector<std::string> names;
    for (const NamedSlider& each : sliders)
        names.push_back(each.name);
    return names;
}

const SliderDescription* sliderNamed(const std::vector<NamedSlider>& sliders, const std::string& name) {
    const auto found = std::find_if(sliders.begin(), sliders.end(),
                                    [&name](const NamedSlider& each) { return each.name == name; });
    return found == sliders.end() ? nullptr : &found->slider;
}

void applyLabelled(CSliderParams& sliders, const ModeDescription& mode, const std::string& label,
                   const std::string& text) {
    const std::string option = "--" + ModeNames::plain(label);
    const std::vector<NamedSlider> known = ModeNames::slidersOf(mode.mode);
    const SliderDescription* slider = sliderNamed(known, option);
    if (!slider)
        throw UsageError(
            option + " is no slider of " + mode.displayName +
            (known.empty() ? " (see `orvela modes`)" : ", which has " + joined(namesOf(known), ", ")));
    setShown(sliders, *slider, option, text);
}

void applyColor(CSliderParams& sliders, const std::string& text) {
    const std::vector<std::string> parts = TextValues::split(text, ',');
    if (parts.size() != 3)
        throw UsageError("--colour " + text + ": three numbers from 0 to 255 are needed, such as 0,255,0");
    for (std::size_t i = 0; i < parts.size(); ++i)
        for (const ColorDescription& color : SliderTable::colors())
            sliders.*color.parts[i] =
                static_cast<float>(TextValues::wholeNumber("--colour", parts[i], 0, 255));
}

// NAME=POSITION, NAME=POSITION,on|off or, for a switch, NAME=on|off.
void applyField(CSliderParams& sliders, const std::string& text) {
    const auto [name, given] = TextValues::assignment("--set", text);
    const SliderField* field = SettingFields::find(name);
    if (!field)
        throw UsageError("--set " + text + ": there is no setting \"" + name +
                         "\"; `orvela modes` lists them");
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

// Puts the final-touch sliders to where their pane starts: a midtone filter that one of them switches on
// reads the others' positions too.
void startFinalTouch(CSliderParams& sliders) {
    for (const PaneSlider& each : PaneTable::sliders(Mode_FinalTouch))
        sliders.*each.slider.value = static_cast<float>(each.initial);
}

void applyFinalTouch(CSliderParams& sliders, const std::string& text) {
    const std::vector<NamedSlider> known = ModeNames::finalTouchSliders();
    for (const std::string& part : TextValues::split(text, ',')) {
        const auto [name, given] = TextValues::assignment("--final-touch", part);
        const SliderDescription* slider = sliderNamed(known, name);
        if (!slider)
            throw UsageError("--final-touch: there is no slider \"" + name + "\"; there are " +
                             joined(namesOf(known), ", "));
        setShown(sliders, *slider, "--final-touch " + name, given);
    }
}

void checkColorIsUsed(const SettingOptions& options, const CSliderParams& sliders) {
    if (options.color && !sliders.mColor_Effect_Intensity_Enabled && !sliders.mColor_Touch_Enabled)
        throw UsageError("--colour needs a colour filter: --mode \"Color Filter\" --value, or "
                         "--final-touch AbsColorFilter=VALUE");
}

void checkSomethingIsSet(const SettingOptions& options, const ModeDescription& mode) {
    if (!PaneTable::threeSliders(mode.mode).empty() && options.labelled.empty() && options.fields.empty() &&
        !options.preset && !options.finalTouch)
        throw UsageError(std::string(mode.displayName) + " needs at least one of " +
                         joined(namesOf(ModeNames::slidersOf(mode.mode)), ", "));
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
        for (const PaneSlider& each : PaneTable::threeSliders(mode))
            if (std::find(labels.begin(), labels.end(), each.slider.label) == labels.end())
                labels.emplace_back(each.slider.label);
    return labels;
}

RunSettings settle(const SettingOptions& options) {
    const ModeDescription& mode = modeFor(options);
    checkSomethingIsSet(options, mode);
    RunSettings run;
    run.params = CUserParamsPhotoshop(mode.mode);
    CSliderParams sliders = run.params.mSliderParams;
    startFinalTouch(sliders);
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
    run.params.mSliderParams = SettingFields::ofStage(sliders, SettingStage::Main);
    run.runsFinalTouch = SettingFields::anyOn(sliders, SettingStage::FinalTouch);
    run.finalTouchParams.mSliderParams = SettingFields::ofStage(sliders, SettingStage::FinalTouch);
    return run;
}

} // namespace orvela
