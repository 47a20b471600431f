#include "Settings/CUserParams.h"

#include "support/BoxRecorder.h"
#include "support/LogCapture.h"
#include "support/ParamsText.h"
#include "support/SettingsMap.h"

#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <algorithm>

using namespace orvela;

namespace {

using Settings = std::map<std::string, double>;

Settings settingsOf(int mode) {
    return orvela::settingsOf(CUserParamsPhotoshop(static_cast<EGUIMode>(mode)).mSliderParams);
}

TEST(CUserParams, ModesSetTheirFieldsAndNoOthers) {
    EXPECT_EQ(settingsOf(12), Settings{});
    EXPECT_EQ(settingsOf(2),
              (Settings{{"AutoContrast_Enabled", 1}, {"Contrast2Value", 1000}, {"Contrast2Enabled", 1}}));
    EXPECT_EQ(settingsOf(9).at("SaltPepperValue"), 218);
    EXPECT_EQ(settingsOf(30), (Settings{{"mColor_Value_G", 255}, {"mColor_Effect_Intensity_Enabled", 1}}));
}

TEST(CUserParams, ModesOfOneFilterDescribeTheirSlider) {
    using P = CSliderParams;
    using namespace SliderScales;
    const struct {
        float P::*field;
        const char* label;
        int scheme;
        float low, high;
        const SliderScale& scale;
    } sliders[] = {{&P::OrvelaLevelValue, "Sharpness I", 6, 30, 71, Sharpness},
                   {&P::OrvelaLevel3Value, "Smart Blur", 9, 0, 1, Thousandth},
                   {&P::ClarityFilterValue, "Illumination", 7, 0, 10, Hundredth},
                   {&P::mDigital_Flash_Value, "Digital Flash", 8, 0, 100, Tenth},
                   {&P::SaturationValue, "Saturation", 8, 0, 10, Hundredth},
                   {&P::Contrast2Value, "Contrast", 1, 0, 100, Tenth},
                   {&P::Brightness2Value, "Brightness", 2, -255, 255, Brightness},
                   {&P::PerceptualGamma, "Gamma", 12, 0.1F, 10, Gamma},
                   {&P::SaltPepperValue, "B&W Spots", 1, 0.5F, 100, Spots},
                   {&P::BilinearFilteringValue, "Noise", 1, 0.5F, 5, Noise},
                   {&P::mMoire_Value, "Moire", 1, 0.1F, 10, Moire},
                   {&P::Temperature_Value, "Temperature", 11, 2000, 10000, Temperature},
                   {&P::mAuto_Color_Value, "AutoColor", 1, 0, 100, Tenth},
                   {&P::mColor_Effect_Intensity_Value, "Color Filter", 11, 0, 100, Tenth}};
    for (int number = 0; number < 34; ++number) {
        CUserParamsPhotoshop params(static_cast<EGUIMode>(number));
        params.reset(); // keeps it
        const GenericSlider shown = CUserParamsPhotoshop(params).mGenericSlider;
        if (number < Mode_SmartSharpness || number > Mode_ColorFilter) {
            EXPECT_TRUE(shown.field == nullptr && shown.label.isEmpty()) << number;
            continue;
        }
        const auto& [field, label, scheme, low, high, scale] = sliders[number - Mode_SmartSharpness];
        EXPECT_TRUE(shown.field == field && shown.scale == &scale) << number;
        EXPECT_EQ(shown.label, label);
        EXPECT_EQ(shown.scheme, scheme) << label;
        EXPECT_EQ(shown.low, low) << label;
        EXPECT_EQ(shown.high, high) << label;
    }
}

TEST(CUserParams, UnknownModesAreReportedOnlyWhenDebugBoxesAreOn) {
    const auto askForUnknown = [] {
        EXPECT_EQ(getModeAsString(static_cast<EGUIMode>(31)), "");
        for (const int mode : {14, 16, 31, -1, 34})
            EXPECT_EQ(settingsOf(mode), Settings{});
    };
    EXPECT_TRUE(boxes(askForUnknown).isEmpty());
    qputenv("ORVELA_DEBUG_MBOX", "1");
    EXPECT_EQ(boxes(askForUnknown), QStringList("Debug Warning|Unknown mode in getModeAsString 31") +
                                        QStringList(5, "Error|unknown mode in CUserParams"));
    qunsetenv("ORVELA_DEBUG_MBOX");
}

TEST(CUserParams, ResetClearsAllButTheKeptFields) {
    CUserParams params =
        paramsFrom("SaturationValue=5 Normal_Picture=0 Soft_Orvela=0 m_L_H_L_F=1 C_H_F_Low_B=2 "
                   "m_Opaco m_M_H_H_F=4 m_M_H_H_F_R=4 m_R_L_L_F_B=5");
    params.mCancelRequested = true;
    params.mProgressCallback = [](int) {};
    params.pHisto_Green[7] = 3;
    params.reset();
    EXPECT_EQ(params.mSliderParams.SaturationValue, 0);
    EXPECT_FALSE(params.mCancelRequested);
    EXPECT_FALSE(params.mProgressCallback);
    EXPECT_TRUE(params.Normal_Picture && params.Soft_Orvela);
    EXPECT_EQ(params.m_L_H_L_F + params.C_H_F_Low_B + params.pHisto_Green[7] + params.m_M_H_H_F, 0);
    EXPECT_TRUE(params.m_Opaco);
    EXPECT_EQ(params.m_M_H_H_F_R, 4);
    EXPECT_EQ(params.m_R_L_L_F_B, 5);
}

TEST(CUserParams, HistogramFileHasAHeaderAndALinePerBin) {
    const QTemporaryDir folder;
    CUserParams params;
    params.pHisto_Red[0] = 1.5;
    params.pHisto_Luma[255] = 4;
    const QString path = folder.filePath("h.txt");
    params.writeHistograms(path.toLocal8Bit());
    QFile file(path);
    ASSERT_TRUE(file.open(QIODevice::ReadOnly));
    EXPECT_EQ(file.readAll(), "Red\tGreen\tBlue\tLuma\n1.5\t0\t0\t0\n" +
                                  QByteArray("0\t0\t0\t0\n").repeated(254) + "0\t0\t0\t4\n");
    params.writeHistograms(folder.filePath("no/h.txt").toLocal8Bit());
}

TEST(CUserParams, ListingFollowsItsOwnOrder) {
    LogCapture log;
    CUserParamsPhotoshop(Mode_Advanced).list(QStringLiteral("X"));
    const std::vector<std::string>& lines = log.lines();
    const auto listed = static_cast<std::size_t>(
        std::ranges::count_if(sliderFields(), [](const SliderField& field) { return field.listed > 0; }));
    // 4 scope lines, those of the slider fields, 56 of the statistics.
    ASSERT_EQ(lines.size(), 4 + listed + 56);
    EXPECT_EQ(lines[0], "-> Begin Globals Listing: X");
    EXPECT_EQ(lines[105], "\t\tmColor_Effect_Intensity_Enabled;: 0");
    EXPECT_EQ(lines[listed + 3], "\tNormal_Picture: 1");
    EXPECT_EQ(lines.back(), "<- End Globals Listing.");
}

} // namespace
