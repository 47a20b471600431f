#include "GUI/Controls/Artwork.h"

#include <QImage>
#include <QSet>

#include <gtest/gtest.h>

namespace {

const char* const k16 = R"(Tools/Tool_Refresh|Tools/Tool_Stop|Tools/Tool_ZoomOut|Tools/Tool_ZoomIn
|Tools/Tool_AllSlidersOn|Tools/Tool_AllSlidersOff|Tools/Tool_DualScreen|Tools/Tool_SingleScreen|Tools/Tool_Undo
|Tools/Tool_Save|Tools/Tool_Delete|Tools/Tool_ArrowDow|Tools/Tool_ArrowUp|Tools/Tool_DoubleArrows_Left
|Tools/Tool_DoubleArrows_Right|Tools/Misc_OK|Tools/Misc_Cancel|Advanced UI/Orb_Red|Advanced UI/Orb_Green
|Advanced UI/Orb_Blue|Advanced UI/Orb_RGB)";
const char* const k24 = R"(Main UI/Kestrand01_24x24|Main UI/Mode_Advanced_24x24|Main UI/Advanced01_24x24
|Main UI/Automatic01_24x24|Main UI/Levels01_24x24|Main UI/Contrast01_24x24|Main UI/AutoColor02_24x24
|Main UI/Saturation_24x24|Main UI/Adjustment01_24x24|Main UI/AllFIlters01_24x24|Main UI/Favorits_24x24
|Main UI/Batch01_24x24|Main UI/Batch01_On_24x24|Main UI/Batch01_Off_24x24|Main UI/Help_24x24
|All Filters/Ilumination_Bulb01_24x24|All Filters/Sharpen_24x24|All Filters/SmartSharpen_24x24
|All Filters/Flash_Icon._24x24|All Filters/Saturation_24x24|All Filters/SmartContrast01_24x24
|All Filters/SmartBrightness_24x24|All Filters/SmartGamma 24x24|All Filters/SmartLevels01_24x24
|All Filters/BW Noise 24x24|All Filters/Noise 24x24|All Filters/Moire 24x24|All Filters/Temperature1_24x24
|All Filters/AutoColor02_24x24|All Filters/Filter_24x24|Mode_Advanced|Mode_Automatic|Mode_AutomaticPro
|Mode_Portrait|Mode_PortraitPro|Mode_Landscape|Mode_LandscapePro|Mode_Macro|Mode_MacroPro)";

qsizetype colorsOf(const QImage& image) {
    QSet<QRgb> colors;
    for (int y = 0; y < image.height(); ++y)
        for (int x = 0; x < image.width(); ++x)
            colors.insert(image.pixel(x, y));
    return colors.size();
}

void expectPictures(const char* paths, QSize size) {
    for (const QString& path : QString::fromUtf8(paths).remove(QLatin1Char('\n')).split(QLatin1Char('|'))) {
        for (int scale : {1, 2}) {
            const QString file = QStringLiteral(":/") + path + (scale == 1 ? ".png" : "@2x.png");
            const QImage image(file);
            EXPECT_EQ(image.size(), size * scale) << qPrintable(file);
            EXPECT_GT(colorsOf(image), 15) << qPrintable(file) << " is nearly empty";
        }
    }
}

TEST(Artwork, EveryPictureLoadsAtBothScales) {
    initArtwork();
    expectPictures(k16, {16, 16});
    expectPictures(k24, {24, 24});
    expectPictures("Advanced UI/Misc_ColorPicker", {180, 120});
    expectPictures("Logo_EyeBig", {128, 128});
}

} // namespace
