#include "Settings/CUserParams.h"

#include "Settings/ModeTable.h"
#include "Utility/DebugBoxes.h"
#include "support/LogCapture.h"
#include "support/ParamsText.h"

#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <map>

using namespace orvela;

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
    EXPECT_EQ(settingsOf(9).at("SaltPepperValue"), 218);
    EXPECT_EQ(settingsOf(30), (Settings{{"mColor_Value_G", 255}, {"mColor_Effect_Intensity_Enabled", 1}}));
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
    // 4 scope lines, 112 of the 117 slider fields, 56 of the 70 statistics.
    ASSERT_EQ(sliderFields().size(), 117U);
    ASSERT_EQ(lines.size(), 4U + 112 + 56);
    EXPECT_EQ(lines[0], "-> Begin Globals Listing: X");
    EXPECT_EQ(lines[105], "\t\tmColor_Effect_Intensity_Enabled;: 0");
    EXPECT_EQ(lines[115], "\tNormal_Picture: 1");
    EXPECT_EQ(lines[171], "<- End Globals Listing.");
}

} // namespace
