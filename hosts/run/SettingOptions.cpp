#include "run/SettingOptions.h"

#include "Settings/PaneTable.h"
#include "Settings/PresetConversion.h"
#include "Settings/SettingFields.h"
#include "Settings/SettingsStore.h"
#include "run/ModeNames.h"
#include "run/NearestNames.h"
#include "run/PresetFiles.h"
#include "run/TextValues.h"
#include "run/UsageError.h"

#include <algorithm>
#include <filesystem>

namespace orvela {

namespace {

using TextValues::joined;

constexpr char kList[] = "`orvela modes` lists all";

const ModeDescription& modeFor(const SettingOptions& options) {
    if (!options.mode)
        return *ModeTable::find(options.preset ? Mode_Advanced : Mode_Automatic);
    if (const ModeDescription* mode = ModeNames::find(*options.mode))
        return *mode;
    throw UsageError("unknown mode \"" + *options.mode + "\"" +
                     NearestNames::advice(*options.mode, ModeNames::identifiers(), kList));
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

const SliderDescription* sliderNamed(const std::vector<NamedSlider>& sliders, const std::string& name) {
    const auto found = std::find_if(sliders.begin(), sliders.end(),
                                    [&name](const NamedSlider& each) { return each.name == name; });
    return found == sliders.end() ? nullptr : &found->slider;
}

void applyLabelled(CSliderParams& sliders, const ModeDescription& mode, const std::string& label,
                   const std::string& text) {
    const std::string option = "--" + NearestNames::plain(label);
    const std::vector<NamedSlider> known = ModeNames::slidersOf(mode.mode);
    const SliderDescription* slider = sliderNamed(known, option);
    if (!slider)
        throw UsageError(option + " is no slider of " + mode.displayName +
                         (known.empty() ? " (see `orvela modes`)"
                                        : ", which has " + joined(ModeNames::namesOf(known), ", ")));
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
        throw UsageError("--set " + text + ": there is no setting \"" + name + "\"" +
                         NearestNames::advice(name, ModeNames::namesOf(sliderFields()), kList));
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

void applyFinalTouch(CSliderParams& sliders, const std::string& text) {
    const std::vector<NamedSlider> known = ModeNames::finalTouchSliders();
    for (const std::string& part : TextValues::split(text, ',')) {
        const auto [name, given] = TextValues::assignment("--final-touch", part);
        const SliderDescription* slider = sliderNamed(known, name);
        if (!slider)
            throw UsageError("--final-touch: there is no slider \"" + name + "\"" +
                             NearestNames::advice(name, ModeNames::namesOf(known), kList));
        setShown(sliders, *slider, "--final-touch " + name, given);
    }
}

void checkColorIsUsed(const SettingOptions& options, const CSliderParams& sliders) {
    if (options.color && !sliders.mColor_Effect_Intensity_Enabled && !sliders.mColor_Touch_Enabled)
        throw UsageError("--colour needs a colour filter: --mode \"Color Filter\" --value, or "
                         "--final-touch AbsColorFilter=VALUE");
}

// Why the run would change nothing, and what to do; empty when it would change something.
std::string idleText(const SettingOptions& options, const ModeDescription& mode, const RunSettings& run) {
    const std::vector<std::string> sliders = ModeNames::namesOf(ModeNames::slidersOf(mode.mode));
    const bool given = options.value || !options.labelled.empty() || !options.fields.empty() ||
                       options.preset || options.finalTouch;
    if (!sliders.empty() && !given)
        return std::string(mode.displayName) +
               " without a number for its slider would change nothing; give " +
               (sliders.size() > 1 ? "at least one of " : "") + joined(sliders, ", ");
    if (run.runsFinalTouch || SettingFields::anyOn(run.params.mSliderParams, SettingStage::Main))
        return {};
    return "nothing is switched on, so nothing would change; use --set NAME=POSITION,on or another --mode";
}

// A file goes before a stored preset of that name: what stands there is in sight.
PresetFile presetNamed(const std::string& given, EGUIMode mode, std::vector<std::string>& notes) {
    const QString name = QString::fromStdString(given);
    const std::optional<CSliderParams> stored = PresetFiles::stored(mode, name);
    std::error_code none;
    const std::filesystem::file_status status = std::filesystem::status(given, none);
    // What cannot be looked at has a message of its own.
    const bool isThere = status.type() != std::filesystem::file_type::not_found;
    if (isThere && !(stored && std::filesystem::is_directory(given, none))) {
        if (stored)
            notes.push_back(given + ": the file is read, not the stored preset of that name");
        return PresetFiles::read(given);
    }
    if (!stored)
        throw UsageError(given + ": there is neither such a file nor such a preset of " +
                         getModeAsString(mode).toStdString() +
                         NearestNames::advice(given, PresetFiles::names(mode), "check the name"));
    PresetFile preset;
    preset.take(*stored);
    return preset;
}

void applyPreset(RunSettings& run, CSliderParams& sliders, const ModeDescription& mode,
                 const std::string& given) {
    const bool hasPresets = PresetConversion::hasControls(mode.mode);
    run.preset = presetNamed(given, hasPresets ? mode.mode : Mode_Advanced, run.notes);
    run.preset.applyTo(sliders);
    if (const QStringList unknown = run.preset.unknownNames(); !unknown.isEmpty())
        run.notes.push_back(given + ": unknown and without effect, but kept: " +
                            unknown.join(QStringLiteral(", ")).toStdString());
}

void setSliders(RunSettings& run, const CSliderParams& sliders) {
    run.preset.take(sliders);
    run.params.mSliderParams = SettingFields::ofStage(sliders, SettingStage::Main);
    run.runsFinalTouch = SettingFields::anyOn(sliders, SettingStage::FinalTouch);
    run.finalTouchParams.mSliderParams = SettingFields::ofStage(sliders, SettingStage::FinalTouch);
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
    RunSettings run;
    run.params = CUserParamsPhotoshop(mode.mode);
    CSliderParams sliders = run.params.mSliderParams;
    PaneTable::startFinalTouch(sliders);
    if (options.preset)
        applyPreset(run, sliders, mode, *options.preset);
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

    setSliders(run, sliders);
    run.idle = idleText(options, mode, run);
    return run;
}

RunSettings settleLast() {
    const auto mode = static_cast<EGUIMode>(openSettings().value(PresetTree::batchModeKey(), -1).toInt());
    const std::optional<CSliderParams> accepted = PresetFiles::lastAccepted(mode);
    if (!accepted)
        throw UsageError("nothing to repeat: nothing was accepted in the window of Orvela that was opened "
                         "last; open it once more, and choose OK");
    RunSettings run;
    run.params = CUserParamsPhotoshop(mode == Mode_FinalTouch ? Mode_Advanced : mode);
    setSliders(run, *accepted);
    return run;
}

} // namespace orvela
