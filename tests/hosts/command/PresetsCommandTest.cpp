#include "ProgramRun.h"
#include "Settings/SettingsStore.h"

using namespace orvela;

namespace {

class PresetsCommand : public ProgramTest {
protected:
    PresetsCommand() {
        settings.clear();
        settings.sync();
        store("in.json", R"({"version": 1, "by": "me", "settings": {"SaturationValue": 640.5,
                             "SaturationEnabled": true, "mColor_Value_R": 7, "Future": 1}})");
    }
    ~PresetsCommand() override { setSettingsApplication(QStringLiteral("OrvelaTests")); }

    static QSettings programStore() {
        setSettingsApplication(QStringLiteral("Orvela"));
        return openSettings();
    }
    QSettings settings = programStore();
};

TEST_F(PresetsCommand, FileToStoreAndBack) {
    const Answer imported = orvela("presets import in.json a/b");
    EXPECT_EQ(imported.status, 0);
    EXPECT_TRUE(imported.says("by, Future"));
    settings.sync();
    settings.beginGroup(QStringLiteral("2000/UserPresets/Advanced/a%2Fb"));
    EXPECT_EQ(settings.value("Sliders/sldrSaturation/Value").toDouble(), 640.5);
    EXPECT_TRUE(settings.value("Sliders/sldrSaturation/Enabled").toBool());
    EXPECT_EQ(settings.value("ColorPickers/colrPickAutoColor/Red").toInt(), 7);
    EXPECT_EQ(orvela("presets list").out, "a/b\n");
    EXPECT_EQ(orvela("presets list --mode FinalTouch").out, "");
    EXPECT_EQ(orvela("presets export a/b in.json").status, 4) << "exists";
    EXPECT_EQ(orvela("presets export a/b in.json --force").status, 0);
    for (const char* kept :
         {"\"by\": \"me\"", "\"Future\": 1", "\"SaturationValue\": 640.5", "\"mColor_Value_R\": 7"})
        EXPECT_TRUE(bytes("in.json").contains(kept)) << kept;
    EXPECT_EQ(orvela("presets export a/b none/out.json").status, 4);
    EXPECT_EQ(orvela("presets remove a/b").status, 0);
    EXPECT_EQ(orvela("presets list").out, "");
}

TEST_F(PresetsCommand, RefusesWhatItMustNotDo) {
    EXPECT_EQ(orvela("presets import in.json --mode SmartLevels").status, 0);
    EXPECT_EQ(orvela("presets import in.json --mode SmartLevels").status, 4);
    EXPECT_EQ(orvela("presets import in.json --mode SmartLevels --force").status, 0);
    EXPECT_EQ(orvela("presets list --mode").status, 2);
    EXPECT_EQ(orvela("presets list --mode Smart-Levels").out, "in\n");
    EXPECT_EQ(orvela("presets import in.json Portrait").status, 4) << "comes with the program";
    EXPECT_EQ(orvela("presets import in.json __batchmodesettings__").status, 2);
    EXPECT_EQ(orvela("presets import missing.json").status, 2);
    const Answer factory = orvela("presets remove Portrait");
    EXPECT_EQ(factory.status, 1);
    EXPECT_TRUE(factory.says("The current preset cannot be deleted, since it's one of the factory presets."));
    EXPECT_EQ(orvela("presets remove other").status, 3);
    EXPECT_EQ(orvela("presets export other out.json").status, 3);
    EXPECT_TRUE(orvela("presets list --mode Portrait").says("Advanced, FinalTouch"));
    EXPECT_EQ(orvela("presets").status, 2);
}

TEST_F(PresetsCommand, ReportsAStoreThatCannotBeWritten) {
    ASSERT_TRUE(QFile::remove(settings.fileName()) && QDir().mkpath(settings.fileName()));
    const Answer answer = orvela("presets import in.json");
    EXPECT_EQ(answer.status, 4);
    EXPECT_TRUE(answer.says(settings.fileName().toStdString()));
    EXPECT_TRUE(QDir().rmdir(settings.fileName()));
}

} // namespace
