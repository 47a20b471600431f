#include "Core/PipelineTable.h"

#include "Filters/Auto_Contrast.h"
#include "Filters/Auto_Gamma.h"
#include "Filters/CAuto_Color.h"
#include "Filters/CAuto_Contrast_I.h"
#include "Filters/CAuto_Contrast_TEST.h"
#include "Filters/CAuto_Contrast_TEST_II.h"
#include "Filters/CAverage.h"
#include "Filters/CBilinear.h"
#include "Filters/CClarity.h"
#include "Filters/CColor.h"
#include "Filters/CContrast_Brightness_Perceptual.h"
#include "Filters/CContrast_Simple_Filter.h"
#include "Filters/CDigital_Flash_Perceptual.h"
#include "Filters/CGamma_Perceptual.h"
#include "Filters/CGamma_Simple_Filter.h"
#include "Filters/CLevel_Dark_Left.h"
#include "Filters/CLevel_Dark_Left_Perceptual.h"
#include "Filters/CLevel_Light_Right.h"
#include "Filters/CLevel_Light_Right_Perceptual.h"
#include "Filters/CLevel_Middle.h"
#include "Filters/CLevel_Middle_Perceptual.h"
#include "Filters/CMedian_Salt_Pepper.h"
#include "Filters/CMoire.h"
#include "Filters/COrv_II_Iter.h"
#include "Filters/COrv_I_Iter.h"
#include "Filters/CSpecial_Contrast_Perceptual.h"
#include "Filters/CTemperature.h"
#include "Filters/Saturation.h"
#include "Filters/Sharp_Smart.h"
#include "Filters/Super_ORV.h"
#include "Filters/Super_ORV_II.h"
#include "Histograms/CHistogram0.h"
#include "Histograms/CHistogram_III.h"
#include "Histograms/CHistogram_IV.h"
#include "Histograms/CHistogram_Luma_Final.h"
#include "Histograms/CHistogram_Luma_after_Orv.h"
#include "Histograms/CHistogram_VII.h"
#include "Histograms/CHistogram_VIII.h"
#include "SmartAnalyzers/CSmartAnalyzer_Digital_Flash.h"
#include "SmartAnalyzers/CSmartAnalyzer_Perceptual_Contrast_Brightness.h"
#include "SmartAnalyzers/CSmartAnalyzer_Perceptual_Level_Dark.h"
#include "SmartAnalyzers/CSmartAnalyzer_Perceptual_Level_Middle.h"
#include "SmartAnalyzers/CSmartAnalyzer_Perceptual_Level_Right.h"
#include "Utility/Logger.h"

#include <QtGlobal>

#include <algorithm>
#include <cstring>

namespace orvela {

namespace {

template <typename Filter>
PipelineTask filter(const char* name, bool (*condition)(const CUserParams&) = nullptr) {
    const auto make = [](const RunContext& context, CUserParams* params, CARGBPlane* in,
                         CARGBPlane* out) -> std::unique_ptr<TaskBase> {
        return std::make_unique<Filter>(context, params, in, out);
    };
    return {name, TaskKind::Filter, make, condition};
}

template <typename Task>
PipelineTask measurement(const char* name, TaskKind kind) {
    const auto make = [](const RunContext& context, CUserParams* params, CARGBPlane* in,
                         CARGBPlane*) -> std::unique_ptr<TaskBase> {
        return std::make_unique<Task>(context, params, in);
    };
    return {name, kind, make};
}

PipelineTask followed(PipelineTask task, void (*afterwards)(CUserParams&)) {
    task.afterwards = afterwards;
    return task;
}

// The class is named once; its text is the name of the entry.
#define FILTER(Class) filter<Class>(#Class)
#define FILTER_WHEN(Class, condition) filter<Class>(#Class, condition)
#define HISTOGRAM(Class) measurement<Class>(#Class, TaskKind::Histogram)
#define ANALYZER(Class) measurement<Class>(#Class, TaskKind::Analyzer)

bool removesSpots(const CUserParams& params) {
    return params.mSliderParams.SaltPepperEnabled;
}

bool usesFlash(const CUserParams& params) {
    return params.mSliderParams.DigitalFlashEnabled;
}

// The comparison decides only the log line: from here on every main run counts as dark in the middle.
void testDarkness(CUserParams& params) {
    if (2 * params.m_Middle_Acu < params.m_Dark_Acu && 5 * params.m_Light_Acu < params.m_Dark_Acu)
        Log::log(LogLevel::Debug, "CMedian_Salt_Pepper determined that the picture is very dark.");
    params.Dark_middle = true;
}

void logAutoContrast(CUserParams& params) {
    Log::log(LogLevel::Debug, "AUTOCONTRAST MODE DETECTED %d", params.mSliderParams.AutoContrast_Enabled);
    if (params.mSliderParams.AutoContrast_Enabled)
        Log::log(LogLevel::Debug, "AUTOCONTRAST MODE DETECTED");
}

void takeInputLuma(CUserParams& params) {
    params.m_OriginalLuma = params.m_OriginalLuma0;
}

constexpr char kFinished[] = "  finished";

// The main pipeline: what measures, brings out texture, and works on colour and noise.
std::vector<PipelineStep> stepsToSpots() {
    return {
        {"Sharp_Smart", QT_TRANSLATE_NOOP("PipelineTable", "Measuring detail"), {FILTER(Sharp_Smart)}},
        {"Histogram (00)",
         QT_TRANSLATE_NOOP("PipelineTable", "Measuring"),
         {HISTOGRAM(CHistogram0)},
         nullptr,
         "  CHistogram00",
         kFinished},
        {"Histogram (0)",
         QT_TRANSLATE_NOOP("PipelineTable", "Measuring"),
         {HISTOGRAM(CHistogram0)},
         nullptr,
         "  CHistogram0",
         kFinished},
        {"Auto_Gamma",
         QT_TRANSLATE_NOOP("PipelineTable", "Automatic gamma, first pass"),
         {FILTER(Auto_Gamma)}},
        {"Histogram (0)",
         QT_TRANSLATE_NOOP("PipelineTable", "Measuring"),
         {HISTOGRAM(CHistogram0)},
         nullptr,
         "  CHistogram0",
         kFinished},
        {"Orvela (Iteration Phase I)",
         QT_TRANSLATE_NOOP("PipelineTable", "Illumination, first pass"),
         {FILTER(COrv_I_Iter)}},
        {"Orvela (Iteration Phase II)",
         QT_TRANSLATE_NOOP("PipelineTable", "Illumination, second pass"),
         {FILTER(COrv_II_Iter)}},
        {"Histo_I", QT_TRANSLATE_NOOP("PipelineTable", "Measuring"), {HISTOGRAM(CHistogram_Luma_after_Orv)}},
        {"Auto_Contrast_I",
         QT_TRANSLATE_NOOP("PipelineTable", "Contrast, first pass"),
         {FILTER(CAuto_Contrast_I)}},
        {"Super_ORV_II", QT_TRANSLATE_NOOP("PipelineTable", "Brightness limit"), {FILTER(Super_ORV_II)}},
        {"Smart Blur",
         QT_TRANSLATE_NOOP("PipelineTable", "Smart blur"),
         {FILTER(Super_ORV), HISTOGRAM(CHistogram_IV)}},
        {"Auto_Color",
         QT_TRANSLATE_NOOP("PipelineTable", "Automatic colour"),
         {followed(FILTER(CAuto_Color), logAutoContrast)}},
        {"Clarity",
         QT_TRANSLATE_NOOP("PipelineTable", "Clarity"),
         {FILTER(CClarity), HISTOGRAM(CHistogram_VII)}},
        {"NEW Auto_Contrast",
         QT_TRANSLATE_NOOP("PipelineTable", "Contrast, second pass"),
         {FILTER(Auto_Contrast)}},
        {"Saturation", QT_TRANSLATE_NOOP("PipelineTable", "Saturation"), {FILTER(Saturation)}},
        {"Noise", QT_TRANSLATE_NOOP("PipelineTable", "Noise"), {followed(FILTER(CBilinear), testDarkness)}},
        {"Black & White spot",
         QT_TRANSLATE_NOOP("PipelineTable", "Black and white spots"),
         {FILTER(CMedian_Salt_Pepper)},
         removesSpots},
    };
}

// What follows: tones, levels and light.
std::vector<PipelineStep> stepsFromGamma() {
    return {
        {"Gamma", QT_TRANSLATE_NOOP("PipelineTable", "Gamma"), {FILTER(CGamma_Simple_Filter)}},
        {"Contrast", QT_TRANSLATE_NOOP("PipelineTable", "Contrast"), {FILTER(CContrast_Simple_Filter)}},
        {"Moire", QT_TRANSLATE_NOOP("PipelineTable", "Moire"), {FILTER(CMoire), FILTER(CAverage)}},
        {"Temperature", QT_TRANSLATE_NOOP("PipelineTable", "Temperature"), {FILTER(CTemperature)}},
        {"Color",
         QT_TRANSLATE_NOOP("PipelineTable", "Colour filter"),
         {FILTER(CColor), HISTOGRAM(CHistogram_VII)}},
        {"Dark_Level", QT_TRANSLATE_NOOP("PipelineTable", "Dark level"), {FILTER(CLevel_Dark_Left)}},
        {"Middle_Level", QT_TRANSLATE_NOOP("PipelineTable", "Middle level"), {FILTER(CLevel_Middle)}},
        {"Light_Level",
         QT_TRANSLATE_NOOP("PipelineTable", "Light level"),
         {FILTER(CLevel_Light_Right), HISTOGRAM(CHistogram_VII),
          ANALYZER(CSmartAnalyzer_Perceptual_Contrast_Brightness)}},
        {" Contrast_Brightness_Perceptual",
         QT_TRANSLATE_NOOP("PipelineTable", "Brightness and contrast"),
         {FILTER(CContrast_Brightness_Perceptual), HISTOGRAM(CHistogram_VIII),
          ANALYZER(CSmartAnalyzer_Digital_Flash), FILTER_WHEN(CDigital_Flash_Perceptual, usesFlash)}},
        {"Histogram XI", QT_TRANSLATE_NOOP("PipelineTable", "Measuring"), {HISTOGRAM(CHistogram_III)}},
        {"cAuto_Contrast_TEST",
         QT_TRANSLATE_NOOP("PipelineTable", "Contrast, third pass"),
         {FILTER(CAuto_Contrast_TEST)}},
        {"Histogram III",
         QT_TRANSLATE_NOOP("PipelineTable", "Measuring levels"),
         {HISTOGRAM(CHistogram_III), ANALYZER(CSmartAnalyzer_Perceptual_Level_Dark),
          ANALYZER(CSmartAnalyzer_Perceptual_Level_Middle), ANALYZER(CSmartAnalyzer_Perceptual_Level_Right)}},
        {"Gamma_Perceptual", QT_TRANSLATE_NOOP("PipelineTable", "Smart gamma"), {FILTER(CGamma_Perceptual)}},
        {"Level_Dark_Perceptual",
         QT_TRANSLATE_NOOP("PipelineTable", "Smart dark level"),
         {FILTER(CLevel_Dark_Left_Perceptual)}},
        {"Level_Middle_Perceptual",
         QT_TRANSLATE_NOOP("PipelineTable", "Smart middle level"),
         {FILTER(CLevel_Middle_Perceptual)}},
        {"Level_Light_Perceptual",
         QT_TRANSLATE_NOOP("PipelineTable", "Smart light level"),
         {FILTER(CLevel_Light_Right_Perceptual)}},
        {"Histogram XI", QT_TRANSLATE_NOOP("PipelineTable", "Measuring"), {HISTOGRAM(CHistogram_III)}},
        {"cAuto_Contrast_TEST II",
         QT_TRANSLATE_NOOP("PipelineTable", "Contrast, fourth pass"),
         {FILTER(CAuto_Contrast_TEST_II)}},
        {"Auto_Gamma",
         QT_TRANSLATE_NOOP("PipelineTable", "Automatic gamma, second pass"),
         {FILTER(Auto_Gamma)}},
    };
}

} // namespace

namespace PipelineTable {

std::span<const PipelineStep> mainSteps() {
    static const std::vector<PipelineStep> steps = [] {
        std::vector<PipelineStep> all = stepsToSpots();
        const std::vector<PipelineStep> rest = stepsFromGamma();
        all.insert(all.end(), rest.begin(), rest.end());
        return all;
    }();
    return steps;
}

std::span<const PipelineTask> finalTouchTasks() {
    static const std::vector<PipelineTask> tasks = {
        HISTOGRAM(CHistogram_Luma_Final),
        FILTER(CContrast_Simple_Filter),
        FILTER(CColor),
        HISTOGRAM(CHistogram_VII),
        FILTER(CLevel_Dark_Left),
        FILTER(CLevel_Middle),
        FILTER(CLevel_Light_Right),
        followed(HISTOGRAM(CHistogram0), takeInputLuma),
        ANALYZER(CSmartAnalyzer_Perceptual_Contrast_Brightness),
        FILTER(CSpecial_Contrast_Perceptual),
        FILTER(CContrast_Brightness_Perceptual),
        HISTOGRAM(CHistogram_III),
        ANALYZER(CSmartAnalyzer_Perceptual_Level_Dark),
        FILTER(CLevel_Dark_Left_Perceptual),
        HISTOGRAM(CHistogram_III),
        ANALYZER(CSmartAnalyzer_Perceptual_Level_Middle),
        FILTER(CLevel_Middle_Perceptual),
        HISTOGRAM(CHistogram_III),
        ANALYZER(CSmartAnalyzer_Perceptual_Level_Right),
        FILTER(CLevel_Light_Right_Perceptual),
    };
    return tasks;
}

std::vector<PipelineTask> allTasks() {
    std::vector<PipelineTask> all;
    const auto addOnce = [&all](const PipelineTask& task) {
        const bool known = std::any_of(all.begin(), all.end(), [&task](const PipelineTask& each) {
            return std::strcmp(each.name, task.name) == 0;
        });
        if (!known)
            all.push_back({task.name, task.kind, task.make});
    };
    for (const PipelineStep& step : mainSteps())
        std::for_each(step.tasks.begin(), step.tasks.end(), addOnce);
    for (const PipelineTask& task : finalTouchTasks())
        addOnce(task);
    return all;
}

} // namespace PipelineTable

} // namespace orvela
