#include "Settings/ModeTable.h"
#include "Settings/PresetConversion.h"
#include "Settings/SettingsStore.h"
#include "Utility/CGenericEx.h"
#include "support/SettingsMap.h"

#include <QPoint>

#include <gtest/gtest.h>

using namespace orvela;

namespace {

class PresetTreeTest : public testing::Test {
protected:
    PresetTreeTest() { openSettings().clear(); }

    static void write(EGUIMode mode, const QString& name, const PresetContent& content) {
        SettingsEdit edit;
        PresetTree::write(edit, mode, name, content);
        edit.commit();
    }
};

TEST_F(PresetTreeTest, KeysAreTheKnownOnes) {
    write(Mode_AutoColor, "Mine", {{{"s", 123.4, true}}, {{"c", 1, 2, 255}}, {{"b", true}}});
    const QSettings settings = openSettings();
    QStringList lines;
    for (const QString& key : settings.allKeys())
        lines << key + '=' + settings.value(key).toString();
    const QString preset = QStringLiteral("2000/UserPresets/Auto Color/Mine/");
    EXPECT_EQ(lines, QStringList({preset + "CheckBoxes/b/Checked=true", preset + "ColorPickers/c/Blue=255",
                                  preset + "ColorPickers/c/Green=2", preset + "ColorPickers/c/Red=1",
                                  preset + "Sliders/s/Enabled=true", preset + "Sliders/s/Value=123.4"}));
    EXPECT_EQ(PresetTree::guiKey(QStringLiteral("batchMode")), "2000/GUI/batchMode");
    EXPECT_EQ(PresetTree::names(Mode_AutoColorFilter), QStringList("Mine")) << "one group for two modes";
    EXPECT_TRUE(PresetTree::names(static_cast<EGUIMode>(16)).isEmpty());
}

TEST_F(PresetTreeTest, EveryNameComesBack) {
    const QStringList names = {
        "a/b",     "a\\b",    "/",          "//x/",    "%2F",   "%252F", "%25/",
        "%/5C",    "50%",     "\"quoted\"", " blank ", "a=b;c", "[x]",   "Grüße 你好 🎞",
        "General", "Sliders", "line\nbreak"};
    for (const QString& name : names)
        write(Mode_Advanced, name, {{{name, 1.5, true}}, {}, {}});
    QStringList listed = PresetTree::names(Mode_Advanced);
    openSettings().sync();
    for (const QString& name : names) {
        EXPECT_EQ(listed.removeAll(name), 1) << qPrintable(name);
        const auto stored = PresetTree::read(Mode_Advanced, name);
        EXPECT_TRUE(stored && stored->sliders.value(0).object == name) << qPrintable(name);
        EXPECT_TRUE(PresetTree::exists(Mode_Advanced, name) && !PresetTree::exists(Mode_Portrait, name));
        SettingsEdit edit;
        PresetTree::remove(edit, Mode_Advanced, name);
        edit.commit();
        EXPECT_FALSE(PresetTree::exists(Mode_Advanced, name)) << qPrintable(name);
    }
    for (const char* none : {"", "Mi", "Sliders/x"})
        EXPECT_FALSE(PresetTree::exists(Mode_Advanced, none));
    EXPECT_TRUE(listed.isEmpty()) << qPrintable(listed.join(' '));
    EXPECT_FALSE(PresetTree::hasPresets());
    SettingsEdit edit;
    EXPECT_THROW(PresetTree::remove(edit, Mode_Advanced, QString()), CGenericEx);
    EXPECT_THROW(PresetTree::write(edit, static_cast<EGUIMode>(-1), names[0], {}), CGenericEx);
}

TEST_F(PresetTreeTest, GarbageReadsAsZeroAndOff) {
    for (const QVariant& value : QVariantList{QVariant(), "abc", "nan", "-inf", QStringList{"1", "2"},
                                              QByteArray("\0\1", 2), QPoint(3, 4), "@Variant(x", ""}) {
        QSettings settings = openSettings();
        settings.beginGroup("2000/UserPresets/Advanced/x");
        for (const char* key : {"Sliders/s/Value", "Sliders/s/Enabled", "ColorPickers/c/Red",
                                "CheckBoxes/b/Checked", "Sliders/t"})
            settings.setValue(key, value);
        settings.setValue("ColorPickers/c/Green", 1e99);
        settings.setValue("Sliders/far/Value", "1e300");
        settings.setValue("Sliders/low/Value", -0.5);
        settings.sync();
        const auto stored = PresetTree::read(Mode_Advanced, QStringLiteral("x"));
        ASSERT_TRUE(stored && stored->sliders.size() == 3);
        EXPECT_EQ(stored->sliders[0].value, 1000);
        EXPECT_EQ(stored->sliders[1].value, 0);
        EXPECT_EQ(stored->sliders[2].value, 0);
        EXPECT_FALSE(stored->sliders[2].enabled || stored->checkBoxes[0].checked);
        EXPECT_EQ(stored->colors[0].red, 0);
        EXPECT_EQ(stored->colors[0].green, 255);
    }
}

TEST_F(PresetTreeTest, TenThousandPresetsAreListed) {
    SettingsEdit edit;
    for (int i = 0; i < 10000; ++i)
        PresetTree::write(edit, Mode_Advanced, QString::number(i),
                          {{{"a", 1, true}, {"b", 2, false}}, {}, {}});
    edit.commit();
    EXPECT_EQ(PresetTree::names(Mode_Advanced).size(), 10000);
}

TEST_F(PresetTreeTest, SettingsBecomeControlsAndComeBack) {
    for (const ModeDescription& mode : ModeTable::all()) {
        SCOPED_TRACE(mode.displayName);
        const CSliderParams sliders = distinctSettings();
        const PresetContent content = PresetConversion::contentOf(mode.mode, sliders);
        const auto back = settingsOf(PresetConversion::paramsOf(mode.mode, content));
        for (const auto& [name, value] : back)
            EXPECT_EQ(value, settingsOf(sliders)[name]) << name;
        // A position and a switch each, the automatic contrast only its switch, three parts of a colour.
        const auto count = 2 * content.sliders.size() + 3 * content.colors.size();
        EXPECT_EQ(back.size(), size_t(mode.mode == Mode_Advanced ? count - 1 : count));
        EXPECT_EQ(PresetConversion::hasControls(mode.mode),
                  mode.mode == Mode_Advanced || mode.mode > Mode_Batch);
    }
}

} // namespace
