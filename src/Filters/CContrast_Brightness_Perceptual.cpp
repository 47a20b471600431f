#include "Filters/CContrast_Brightness_Perceptual.h"

#include "Filters/Curves/PivotCurve.h"
#include "Filters/Kernels/PixelMath.h"
#include "Filters/Kernels/RowMapping.h"
#include "Utility/Logger.h"

#include <cmath>

using namespace orvela;

namespace {

bool isWanted(const CSliderParams& s) {
    if (s.AutoContrast_Enabled)
        return false;
    const bool plain =
        s.ContrastEnabled || s.BrightnessEnabled || s.mContrast_Touch_Enabled || s.mBrightness_Touch_Enabled;
    return s.Contrast2Enabled || s.Brightness2Enabled || s.mPerceptual_Contrast_Touch_Enabled ||
           (s.mPerceptual_Brightness_Touch_Enabled && !plain);
}

} // namespace

float PerceptualContrast::weight(int sum) const {
    const auto pixelMean = static_cast<float>(sum / 3.0);
    return static_cast<float>(1 / std::cosh((static_cast<double>(mean) - pixelMean) / 100));
}

int PerceptualContrast::apply(int c, float weight) const {
    const float brightened = std::trunc(PivotCurve::clampAdd(c, brightness));
    const float k = weight * (brightened <= mean ? low : high);
    return PixelMath::trunc(PivotCurve::apply(brightened, mean, k));
}

const TaskDescription& CContrast_Brightness_Perceptual::description() const {
    static constexpr TaskDescription kMain = {.source = "Filters/CContrast_Brightness_Perceptual",
                                              .line = 160};
    static constexpr TaskDescription kTouch = {.source = "Filters/CContrast_Brightness_Perceptual",
                                               .line = 206};
    return mParams->Final_Touch_Mode_Enabled ? kTouch : kMain;
}

bool CContrast_Brightness_Perceptual::applies() {
    return isWanted(mParams->mSliderParams);
}

void CContrast_Brightness_Perceptual::setUp() {
    mActive = mParams->Final_Touch_Mode_Enabled ? prepareTouch() : prepareMain();
    if (!mActive)
        return;
    mTable.build([this](int sum) {
        return [this, weight = mContrast.weight(sum)](int c) { return mContrast.apply(c, weight); };
    });
}

bool CContrast_Brightness_Perceptual::prepareMain() {
    const CSliderParams& s = mParams->mSliderParams;
    if ((!s.Contrast2Enabled && !s.Brightness2Enabled) || s.ContrastEnabled || s.BrightnessEnabled ||
        mParams->Under_Exposed_Picture)
        return false;
    Log::log(LogLevel::Debug, "CContrast_Brightness_Perceptual 1st Condition matched.");
    if (s.Contrast2Enabled)
        takeContrast(s.Contrast2Value);
    if (static_cast<float>(mParams->pHisto_Luma[255]) > 1)
        mContrast.high = 0;
    if (static_cast<float>(mParams->pHisto_Luma[0]) > 0)
        mContrast.low = 0;
    if (s.Brightness2Enabled)
        takeBrightness(s.Brightness2Value);
    if (mContrast.high == 0 && mContrast.low == 0 && mContrast.brightness == 0)
        return false;
    Log::log(LogLevel::Debug, "Contrast_Value_High%f", static_cast<double>(mContrast.high));
    Log::log(LogLevel::Debug, "Contrast_Value_Low %f", static_cast<double>(mContrast.low));
    mContrast.mean = mParams->m_OriginalLuma;
    return true;
}

bool CContrast_Brightness_Perceptual::prepareTouch() {
    const CSliderParams& s = mParams->mSliderParams;
    if ((!s.mPerceptual_Contrast_Touch_Enabled && !s.mPerceptual_Brightness_Touch_Enabled) ||
        s.mContrast_Touch_Enabled || s.mBrightness_Touch_Enabled || mParams->Under_Exposed_Picture)
        return false;
    Log::log(LogLevel::Debug, "CContrast_Brightness_Perceptual Touch 1st Condition matched.");
    mContrast.mean = mParams->m_OriginalLuma;
    logTouch();
    if (s.mPerceptual_Contrast_Touch_Enabled)
        takeContrast(s.mPerceptual_Contrast_Touch_Value);
    if (s.mPerceptual_Brightness_Touch_Enabled)
        takeBrightness(s.mPerceptual_Brightness_Touch_Value);
    Log::log(LogLevel::Debug, "CContrast_Brightness_Perceptual 2nd Condition matched.");
    return true;
}

void CContrast_Brightness_Perceptual::takeContrast(float position) {
    const double v = position;
    mContrast.high = static_cast<float>(mParams->m_P_C_H_C_High * v / 1000);
    mContrast.low = static_cast<float>(mParams->m_P_C_H_C_Low * v / 1000);
}

void CContrast_Brightness_Perceptual::takeBrightness(float position) {
    const float factor = position <= 500 ? mParams->m_B_H_C_F_Low : mParams->m_B_H_C_F_High;
    mContrast.brightness = static_cast<float>((static_cast<double>(position) - 500) / 500 * factor);
}

void CContrast_Brightness_Perceptual::logTouch() const {
    const CSliderParams& s = mParams->mSliderParams;
    const auto number = [](const char* format, float value) {
        Log::log(LogLevel::Debug, format, static_cast<double>(value));
    };
    const auto flag = [](const char* format, bool value) { Log::log(LogLevel::Debug, format, value); };
    number("Mean_H %f", mContrast.mean);
    number("m_P_C_H_C_High %f", mParams->m_P_C_H_C_High);
    number("m_P_C_H_C_Low %f", mParams->m_P_C_H_C_Low);
    number("m_B_H_C_F_High %f", mParams->m_B_H_C_F_High);
    number("m_B_H_C_F_Low %f", mParams->m_B_H_C_F_Low);
    flag("Perceptual_Contrast_Touch_Enabled %d", s.mPerceptual_Contrast_Touch_Enabled);
    flag("Perceptual_Brightness_Touch_Enabled %d", s.mPerceptual_Brightness_Touch_Enabled);
    flag("!Contrast_Touch_Enabled %d", !s.mContrast_Touch_Enabled);
    flag("!Brightness_Touch_Enabled %d", !s.mBrightness_Touch_Enabled);
    number("Perceptual_Contrast_Touch_Value %f", s.mPerceptual_Contrast_Touch_Value);
    number("Perceptual_Brightness_Touch_Value %f", s.mPerceptual_Brightness_Touch_Value);
}

void CContrast_Brightness_Perceptual::mapRow(const PixelRow& row) const {
    if (mActive)
        mTable.map(row);
    else
        copyPixels(row);
}
