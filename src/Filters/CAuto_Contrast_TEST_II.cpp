#include "Filters/CAuto_Contrast_TEST_II.h"

#include "Filters/Kernels/HistogramRecount.h"
#include "Filters/Kernels/PixelMath.h"
#include "Settings/Conditions.h"
#include "Utility/Logger.h"

#include <cmath>

using namespace orvela;

const TaskDescription& CAuto_Contrast_TEST_II::description() const {
    static constexpr TaskDescription kDescription = {
        .source = "Filters/CAuto_Contrast_TEST_II",
        .line = 310,
        .dumpName = "CAuto_Contrast_TEST_II",
        .completion = "CAuto_Contrast_TEST_II Filter complete.",
    };
    return kDescription;
}

bool CAuto_Contrast_TEST_II::applies() {
    const bool automatic = isAutomaticMode(mParams->mSliderParams);
    Log::log(LogLevel::Debug, "Bicromic=%d.", mParams->Bicromic);
    Log::log(LogLevel::Debug, "Automatic_Mode=%d.", automatic);
    return (mParams->Normal_Picture && automatic) || mParams->mSliderParams.mAuto_Color_Enabled;
}

void CAuto_Contrast_TEST_II::setUp() {
    Log::log(LogLevel::Debug, "CAuto_Contrast_TEST_II Condition matched and Soft_Orvela is %d.",
             mParams->Soft_Orvela);
    mParams->Shift_Level = 1.0F;
    storeHistograms();

    const double root = std::sqrt(static_cast<double>(picturePixels()));
    const auto hazyThreshold = static_cast<float>(root >= 700 ? root : 0);
    mThreshold = static_cast<float>(TonalStretch::baseThreshold(picturePixels()));
    TonalStretch::Limits luma;
    mHazy = TonalStretch::storeHaze(*mParams, luma, mThreshold * mParams->Shift_Level,
                                    hazyThreshold * mParams->Shift_Level);
    C_Left_limit = luma.black;
    C_Right_limit = luma.white;
    if (!mHazy)
        readChannelLimits();
    prepareCurves();
}

void CAuto_Contrast_TEST_II::storeHistograms() {
    measured([this] { recountHistograms(*mInPlane, *mParams, 1, 1); });
    Log::log(LogLevel::Debug, "iImageSize: %f ", static_cast<double>(picturePixels()));
    if (!Log::writes(LogLevel::Debug))
        return;
    for (std::size_t i = 0; i < 256; ++i) {
        const int bin = static_cast<int>(i);
        Log::log(LogLevel::Debug, "pHisto_Red[%d]:%f", bin, mParams->pHisto_Red[i]);
        Log::log(LogLevel::Debug, "pHisto_Green[%d]:%f", bin, mParams->pHisto_Green[i]);
        Log::log(LogLevel::Debug, "pHisto_Blue[%d]:%f", bin, mParams->pHisto_Blue[i]);
        Log::log(LogLevel::Debug, "pHisto_Luma[%d]:%f", bin, mParams->pHisto_Luma[i]);
    }
}

void CAuto_Contrast_TEST_II::readChannelLimits() {
    Log::log(LogLevel::Debug, "threshold: %f ", static_cast<double>(mThreshold));
    const auto read = [this](const Histogram& bins, const char* leftText, const char* rightText, int& left,
                             int& right) {
        if (const auto i = TonalStretch::scanLeft(bins, mThreshold, 255)) {
            left = PixelMath::trunc(*i - 0.5 * *i);
            Log::log(LogLevel::Debug, "i=%d  %s: %d", *i, leftText, left);
        }
        if (const auto i = TonalStretch::scanRight(bins, mThreshold, 0)) {
            right = PixelMath::trunc((255 - *i) * 0.5 + *i);
            Log::log(LogLevel::Debug, "i=%d  %s: %d", *i, rightText, right);
        }
        return right - left >= 1 ? static_cast<float>(255.0 / (right - left)) : 1.0F;
    };
    HighLight_Radio_R =
        read(mParams->pHisto_Red, " Left_Limit_R", "2Right_Limit_R", Left_Limit_R, Right_Limit_R);
    HighLight_Radio_G =
        read(mParams->pHisto_Green, "2Left_Limit_G", "Right_Limit_G", Left_Limit_G, Right_Limit_G);
    HighLight_Radio_B =
        read(mParams->pHisto_Blue, "Left_Limit_B", "Right_Limit_B", Left_Limit_B, Right_Limit_B);

    Log::log(LogLevel::Debug, "threshold\t: %f", static_cast<double>(mThreshold));
    const auto list = [](char channel, int left, int right, float factor) {
        Log::log(LogLevel::Debug, "Left_Limit_%c: %d", channel, left);
        Log::log(LogLevel::Debug, "Right_Limit_%c: %d", channel, right);
        Log::log(LogLevel::Debug, "HighLight_Radio_%c: %f", channel, static_cast<double>(factor));
    };
    list('R', Left_Limit_R, Right_Limit_R, HighLight_Radio_R);
    list('G', Left_Limit_G, Right_Limit_G, HighLight_Radio_G);
    list('B', Left_Limit_B, Right_Limit_B, HighLight_Radio_B);
}

void CAuto_Contrast_TEST_II::prepareCurves() {
    mHazyCurve = makeTable([this](int value) {
        return TonalStretch::stretchHazy(value, {C_Left_limit, C_Right_limit});
    });
    const auto curve = [](int left, int right, float factor) {
        return makeTable<WideTable>([=](int value) { return stretch(value, {left, right}, factor); });
    };
    mCurves = {curve(Left_Limit_R, Right_Limit_R, HighLight_Radio_R),
               curve(Left_Limit_G, Right_Limit_G, HighLight_Radio_G),
               curve(Left_Limit_B, Right_Limit_B, HighLight_Radio_B)};
}

// The quotient is stored as a float: in double it would fall just below some whole results.
int CAuto_Contrast_TEST_II::stretch(int value, TonalStretch::Limits limits, float factor) {
    if (value < limits.black)
        return PixelMath::trunc(static_cast<float>((255.0 / limits.white - 1 + 1) * value));
    return PixelMath::trunc(static_cast<float>(value - limits.black) * factor);
}

void CAuto_Contrast_TEST_II::mapRow(const PixelRow& row) const {
    if (mHazy)
        mapChannels(mHazyCurve, row);
    else
        mapKeepingHue(mCurves, row);
}
