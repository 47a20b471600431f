#include "Utility/CUserParams.h"

#include "Utility/DebugBoxes.h"
#include "Utility/ModeTable.h"
#include "support/LogCapture.h"

#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <map>

namespace {

// What a mode sets, by field name; everything else must be 0 and off.
using Settings = std::map<std::string, double>;

Settings settingsOf(const CSliderParams& sliders) {
    Settings settings;
    for (const SliderField& field : sliderFields()) {
        const double value = field.flag ? double(sliders.*field.flag) : double(sliders.*field.value);
        if (value != 0)
            settings[field.name] = value;
    }
    return settings;
}

Settings settingsOf(int mode) {
    return settingsOf(CUserParamsPhotoshop(static_cast<EGUIMode>(mode)).mSliderParams);
}

TEST(CUserParams, ModesSetTheirFieldsAndNoOthers) {
    EXPECT_EQ(settingsOf(12), Settings{});
    EXPECT_EQ(settingsOf(2),
              (Settings{{"AutoContrast_Enabled", 1}, {"Contrast2Value", 1000}, {"Contrast2Enabled", 1}}));
    EXPECT_EQ(settingsOf(3), (Settings{{"PerceptualDark", 800},
                                       {"PerceptualDarkEnabled", 1},
                                       {"PerceptualMiddle", 500},
                                       {"PerceptualMiddleEnabled", 1},
                                       {"PerceptualLight", 800},
                                       {"PerceptualLightEnabled", 1}}));
    EXPECT_EQ(settingsOf(10), (Settings{{"OrvelaLevelValue", 293},
                                        {"OrvelaLevelEnabled", 1},
                                        {"OrvelaLevel2Value", 293},
                                        {"OrvelaLevel2Enabled", 1},
                                        {"OrvelaLevel3Value", 150},
                                        {"OrvelaLevel3Enabled", 1},
                                        {"Contrast2Value", 100},
                                        {"Contrast2Enabled", 1},
                                        {"BilinearFilteringValue", 250},
                                        {"BilinearFilteringEnabled", 1},
                                        {"Brightness2Value", 600},
                                        {"ClarityFilterValue", 600},
                                        {"mDigital_Flash_Value", 600},
                                        {"SaturationValue", 700},
                                        {"SaturationEnabled", 1},
                                        {"mFade_Value", 1},
                                        {"mFade_Enabled", 1}}));
    EXPECT_EQ(settingsOf(9).at("SaltPepperValue"), 218);
    EXPECT_EQ(settingsOf(17), (Settings{{"OrvelaLevelEnabled", 1}}));
    EXPECT_EQ(settingsOf(21), (Settings{{"SaturationValue", 500}, {"SaturationEnabled", 1}}));
    EXPECT_EQ(settingsOf(30), (Settings{{"mColor_Value_G", 255}, {"mColor_Effect_Intensity_Enabled", 1}}));
}

TEST(CUserParams, SingleSliderModesDescribeTheirSlider) {
    const CUserParamsPhotoshop spots(Mode_SpotsRemoval);
    EXPECT_EQ(spots.mGenericSlider.field, &CSliderParams::SaltPepperValue);
    EXPECT_EQ(spots.mGenericSlider.label, "B&W Spots");
    EXPECT_EQ(spots.mGenericSlider.low, 0.5F);
    EXPECT_DOUBLE_EQ(spots.mGenericSlider.scale->toShown(500), 50.25);
    EXPECT_EQ(CUserParamsPhotoshop(Mode_Automatic).mGenericSlider.field, nullptr);
}

QStringList gBoxes;

int recordBox(void*, const QString& title, const QString& text, int, int) {
    gBoxes << title + "|" + text;
    return DebugBoxes::Ok;
}

TEST(CUserParams, UnknownModesAreReportedOnlyWhenDebugBoxesAreOn) {
    DebugBoxes::setPresenter(recordBox);
    gBoxes.clear();
    EXPECT_EQ(getModeAsString(static_cast<EGUIMode>(16)), "");
    EXPECT_EQ(settingsOf(14), Settings{});
    EXPECT_TRUE(gBoxes.isEmpty());
    qputenv("ORVELA_DEBUG_MBOX", "1");
    for (const int mode : {14, 16, 31, -1, 34})
        EXPECT_EQ(settingsOf(mode), Settings{});
    EXPECT_EQ(gBoxes, QStringList(5, "Error|unknown mode in CUserParams"));
    gBoxes.clear();
    getModeAsString(static_cast<EGUIMode>(31));
    EXPECT_EQ(gBoxes, QStringList{"Debug Warning|Unknown mode in getModeAsString 31"});
    qunsetenv("ORVELA_DEBUG_MBOX");
    DebugBoxes::setPresenter(nullptr);
    EXPECT_EQ(getModeAsString(Mode_AutoColorFilter), "Auto Color");
    EXPECT_EQ(ModeTable::all().size(), 32U);
}

TEST(CUserParams, ResetClearsAllButTheKeptFields) {
    CUserParams params;
    params.mSliderParams.SaturationValue = 5;
    params.mCancelRequested = true;
    params.mProgressCallback = [](int) {};
    params.Normal_Picture = false;
    params.Soft_Orvela = false;
    params.m_L_H_L_F = 1;
    params.C_H_F_Low_B = 2;
    params.pHisto_Green[7] = 3;
    params.m_Opaco = true;
    params.m_M_H_H_F = 4;
    params.m_M_H_H_F_R = 4;
    params.m_R_L_L_F_B = 5;
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

TEST(CUserParams, CopyCarriesHistogramsFlagsAndHooks) {
    CUserParamsPhotoshop source(Mode_Temperature);
    source.pHisto_Luma[255] = 12;
    source.mCancelRequested = true;
    CUserParamsPhotoshop copy;
    copy = source;
    EXPECT_EQ(copy.pHisto_Luma[255], 12);
    EXPECT_TRUE(copy.mCancelRequested);
    EXPECT_EQ(copy.mGenericSlider.label, "Temperature");
    EXPECT_TRUE(copy.mSliderParams.Temperature_Enabled);
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
    const QList<QByteArray> lines = file.readAll().split('\n');
    ASSERT_EQ(lines.size(), 258);
    EXPECT_EQ(lines[0], "Red\tGreen\tBlue\tLuma");
    EXPECT_EQ(lines[1], "1.5\t0\t0\t0");
    EXPECT_EQ(lines[256], "0\t0\t0\t4");
    params.writeHistograms(folder.filePath("no/h.txt").toLocal8Bit());
}

TEST(CUserParams, ListingFollowsItsOwnOrder) {
    LogCapture log;
    CUserParamsPhotoshop(Mode_Advanced).list(QStringLiteral("X"));
    const std::vector<std::string>& lines = log.lines();
    // 4 scope lines, 112 of the 117 slider fields, 56 of the 70 statistics.
    ASSERT_EQ(sliderFields().size(), 117U);
    ASSERT_EQ(lines.size(), 4U + 112 + 56);
    EXPECT_EQ(lines[0], "-> Begin Globals Listing: X");
    EXPECT_EQ(lines[1], "\t-> Begin Slider Param Listing: X");
    EXPECT_EQ(lines[2], "\t\tTemperature_Value: 0.000000");
    EXPECT_EQ(lines[10], "\t\tAutoContrast_Enabled: 0");
    EXPECT_EQ(lines[34], "\t\tmDigital_Flash_Value: 0.000000");
    EXPECT_EQ(lines[40], "\t\tmContrast_Touch_Value: 0.000000");
    EXPECT_EQ(lines[105], "\t\tmColor_Effect_Intensity_Enabled;: 0");
    EXPECT_EQ(lines[113], "\t\tNoise_Cleaner_Off: 0");
    EXPECT_EQ(lines[114], "\t<- End Slider Param Listing");
    EXPECT_EQ(lines[115], "\tNormal_Picture: 1");
    EXPECT_EQ(lines[118], "\tSoft_Orvela: 1");
    EXPECT_EQ(lines[170], "\tmMeanH: 0");
    EXPECT_EQ(lines[171], "<- End Globals Listing.");
}

} // namespace
