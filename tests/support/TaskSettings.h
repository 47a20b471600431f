#pragma once

#include "Core/PipelineTable.h"
#include "Settings/CUserParams.h"
#include "support/TestPlanes.h"

#include <map>
#include <stdexcept>
#include <string>
#include <vector>

namespace orvela {

/// Settings under which a task does its work.
namespace tasksettings {

/// The switches that make a task apply to an ordinary picture; a task that is not listed needs none.
inline const std::map<std::string, std::vector<bool CSliderParams::*>>& switches() {
    using P = CSliderParams;
    static const std::map<std::string, std::vector<bool P::*>> table = {
        {"Auto_Gamma", {&P::mAuto_Color_Enabled}},
        {"COrv_I_Iter", {&P::OrvelaLevelEnabled}},
        {"COrv_II_Iter", {&P::OrvelaLevel2Enabled}},
        {"CHistogram_Luma_after_Orv", {&P::OrvelaLevelEnabled}},
        {"CAuto_Contrast_I", {&P::OrvelaLevelEnabled}},
        {"Super_ORV_II", {&P::OrvelaLevelEnabled}},
        {"Super_ORV", {&P::OrvelaLevel3Enabled}},
        {"CHistogram_IV", {&P::mAuto_Color_Enabled}},
        {"CAuto_Color", {&P::mAuto_Color_Enabled}},
        {"CClarity", {&P::ClarityFilterEnabled}},
        {"Auto_Contrast", {&P::AutoContrast_Enabled}},
        {"Saturation", {&P::SaturationEnabled}},
        {"CBilinear", {&P::BilinearFilteringEnabled}},
        {"CMedian_Salt_Pepper", {&P::SaltPepperEnabled}},
        {"CGamma_Simple_Filter", {&P::GammaCorrectionEnabled}},
        {"CContrast_Simple_Filter", {&P::ContrastEnabled, &P::BrightnessEnabled}},
        {"CMoire", {&P::Moire_Enabled}},
        {"CTemperature", {&P::Temperature_Enabled}},
        {"CColor", {&P::mColor_Effect_Intensity_Enabled}},
        {"CLevel_Dark_Left", {&P::mAbsolute_Dark_Enabled}},
        {"CLevel_Middle", {&P::mAbsolute_Middle_Enabled}},
        {"CLevel_Light_Right", {&P::mAbsolute_Light_Enabled}},
        {"CSmartAnalyzer_Perceptual_Contrast_Brightness", {&P::Contrast2Enabled, &P::Brightness2Enabled}},
        {"CContrast_Brightness_Perceptual", {&P::Contrast2Enabled, &P::Brightness2Enabled}},
        {"CSpecial_Contrast_Perceptual", {&P::Contrast2Enabled}},
        {"CHistogram_VIII", {&P::DigitalFlashEnabled}},
        {"CSmartAnalyzer_Digital_Flash", {&P::DigitalFlashEnabled}},
        {"CDigital_Flash_Perceptual", {&P::DigitalFlashEnabled}},
        {"CAuto_Contrast_TEST", {&P::BrightnessEnabled}},
        {"CSmartAnalyzer_Perceptual_Level_Dark", {&P::PerceptualDarkEnabled}},
        {"CSmartAnalyzer_Perceptual_Level_Middle", {&P::PerceptualMiddleEnabled}},
        {"CSmartAnalyzer_Perceptual_Level_Right", {&P::PerceptualLightEnabled}},
        {"CGamma_Perceptual", {&P::PerceptualGammaEnabled}},
        {"CLevel_Dark_Left_Perceptual", {&P::PerceptualDarkEnabled}},
        {"CLevel_Middle_Perceptual", {&P::PerceptualMiddleEnabled}},
        {"CLevel_Light_Right_Perceptual", {&P::PerceptualLightEnabled}},
        {"CAuto_Contrast_TEST_II", {&P::mAuto_Color_Enabled}},
    };
    return table;
}

/// Every slider at `position` and only the task's own switches on.
inline CUserParamsPhotoshop paramsFor(const std::string& task, float position = 700) {
    CUserParamsPhotoshop params;
    for (const SliderField& field : sliderFields()) {
        if (field.value)
            params.mSliderParams.*field.value = position;
    }
    if (const auto found = switches().find(task); found != switches().end()) {
        for (bool CSliderParams::*flag : found->second)
            params.mSliderParams.*flag = true;
    }
    return params;
}

/// The registry, asked for once.
inline const std::vector<PipelineTask>& allTasks() {
    static const std::vector<PipelineTask> tasks = PipelineTable::allTasks();
    return tasks;
}

/// A task of the pipelines by its class name.
inline const PipelineTask& taskNamed(const std::string& name) {
    for (const PipelineTask& task : allTasks()) {
        if (task.name == name)
            return task;
    }
    throw std::invalid_argument("no task named " + name);
}

/// Runs a task by its class name.
inline bool run(const std::string& name, CUserParams& params, CARGBPlane& in, CARGBPlane& out) {
    return taskNamed(name).make({}, &params, &in, &out)->Apply();
}

/// Runs a task on a picture in place.
inline bool apply(const std::string& name, CUserParams& params, CARGBPlane& plane) {
    CARGBPlane out(plane, QStringLiteral("out"));
    return run(name, params, plane, out);
}

/// Leaves in `params` what the pipeline's measurements and analyzers would know of the picture.
inline void measure(CUserParams& params, CARGBPlane& in, CARGBPlane& out) {
    for (const char* name : {"CHistogram0", "CHistogram_VII", "CHistogram_III"})
        run(name, params, in, out);
    for (const PipelineTask& task : allTasks()) {
        if (task.kind == TaskKind::Analyzer)
            task.make({}, &params, &in, &out)->Apply();
    }
}

} // namespace tasksettings

} // namespace orvela
