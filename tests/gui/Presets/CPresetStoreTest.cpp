#include "GUI/Presets/CPresetStore.h"

#include "GUI/Controls/CColorPicker.h"
#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Panes/CWgtPaneAdvancedImpl.h"
#include "GUI/Presets/CBatchMode.h"
#include "Settings/SettingsStore.h"
#include "gui/Panes/PaneFixture.h"
#include "support/BoxAnswer.h"
#include "support/BoxRecorder.h"
#include "support/LogCapture.h"
#include "support/SettingsMap.h"

#include <QCheckBox>
#include <QDir>

#include <gtest/gtest.h>

using namespace orvela;

namespace {

class CPresetStoreTest : public testing::Test {
protected:
    CPresetStoreTest() {
        openSettings().clear();
        first->setObjectName("first");
        second->setObjectName("a/b");
        picker->setObjectName("picker");
        box->setObjectName("box");
    }
    bool save(const char* name, EGUIMode mode = Mode_Advanced) {
        CPresetStore::savePreset(&pane, mode, name, saved, isNew, true);
        return saved;
    }

    QWidget pane;
    QWidget inner{&pane};
    COrvelaSliderBlockImpl* first = new COrvelaSliderBlockImpl(&inner);
    COrvelaSliderBlockImpl* second = new COrvelaSliderBlockImpl(&pane);
    CColorPicker* picker = new CColorPicker(&inner);
    QCheckBox* box = new QCheckBox(&inner);
    QCheckBox* unnamed = new QCheckBox(&inner);
    QString said;
    bool saved = false;
    bool isNew = false;
};

TEST_F(CPresetStoreTest, LoadsWhatWasSaved) {
    first->setValue(123.4);
    second->setValue(1000);
    second->setEnabled(false);
    picker->setColor(QColor(1, 2, 3, 40));
    box->setChecked(true);
    ASSERT_TRUE(save("mine", Mode_AutoColor) && isNew);
    first->setValue(0);
    second->setValue(0);
    second->setEnabled(true);
    picker->setColor(Qt::white);
    box->setChecked(false);
    QStringList signalsOfSecond;
    QObject::connect(second, &COrvelaSliderBlockImpl::stateChanged, [&] { signalsOfSecond << "state"; });
    QObject::connect(second, &COrvelaSliderBlockImpl::valueChanged, [&] { signalsOfSecond << "value"; });
    CPresetStore::loadPreset(&pane, Mode_AutoColorFilter, "mine");
    EXPECT_EQ(first->value(), 123.4);
    EXPECT_EQ(second->value(), 1000);
    EXPECT_TRUE(first->isEnabled() && !second->isEnabled() && box->isChecked());
    EXPECT_EQ(picker->color(), QColor(1, 2, 3, 255));
    EXPECT_EQ(signalsOfSecond.value(0), "state");
    EXPECT_EQ(signalsOfSecond.value(1), "value");
    EXPECT_FALSE(openSettings().allKeys().join(' ').contains("CheckBoxes/Checked")) << "has no name";
}

TEST_F(CPresetStoreTest, MissingPartsLeaveControlsAsTheyAre) {
    qputenv("ORVELA_DEBUG_MBOX", "1");
    ASSERT_TRUE(save("x"));
    QSettings settings = openSettings();
    settings.beginGroup("2000/UserPresets/Advanced/x");
    settings.remove("ColorPickers");
    settings.remove("CheckBoxes/box");
    settings.remove("Sliders/first/Value");
    settings.setValue("Sliders/gone/Value", 5);
    settings.setValue("CheckBoxes/lost/Checked", true);
    settings.setValue("ColorPickers/away/Red", 5);
    settings.sync();
    first->setValue(500);
    box->setChecked(true);
    picker->setColor(Qt::red);
    EXPECT_TRUE(boxes([&] { CPresetStore::loadPreset(&pane, Mode_Advanced, "unknown"); }).isEmpty());
    EXPECT_EQ(first->value(), 500);
    LogCapture log;
    EXPECT_EQ(boxes([&] { CPresetStore::loadPreset(&pane, Mode_Advanced, "x"); }),
              QStringList({"Debug Warning|gone, the slider can not be found.",
                           "Debug Warning|lost, the checkbox for this preset can not be found."}));
    EXPECT_TRUE(log.has("The color picker for preset (away) can not be found."));
    EXPECT_EQ(first->value(), 0);
    EXPECT_TRUE(box->isChecked() && picker->color() == QColor(Qt::red));
    qunsetenv("ORVELA_DEBUG_MBOX");
}

TEST_F(CPresetStoreTest, AsksBeforeOverwriting) {
    ASSERT_TRUE(save("x") && save(CPresetStore::batchPresetName().toUtf8()));
    ASSERT_TRUE(save(CPresetStore::batchPresetName().toUtf8()) && isNew) << "never asked for";
    EXPECT_EQ(CPresetStore::listPresets(Mode_Advanced, true), QStringList("x"));
    EXPECT_EQ(CPresetStore::listPresets(Mode_Advanced, false).size(), 2);
    EXPECT_FALSE(CPresetStore::presetExists(Mode_Advanced, CPresetStore::batchPresetName()));
    first->setValue(700);
    answerBox(QMessageBox::No, said);
    EXPECT_FALSE(save("x"));
    EXPECT_EQ(said, "Warning|This preset already exists. Do you want to overwrite it?");
    const QString key = "2000/UserPresets/Advanced/x/Sliders/first/Value";
    EXPECT_EQ(openSettings().value(key).toDouble(), 0);
    answerBox(QMessageBox::Yes, said);
    EXPECT_TRUE(save("x") && !isNew);
    EXPECT_EQ(openSettings().value(key).toDouble(), 700);
    EXPECT_EQ(boxes([&] { EXPECT_FALSE(save("")); }), QStringList("Warning|A preset needs a name."));
    CPresetStore::removePreset(Mode_Advanced, "x");
    EXPECT_TRUE(CPresetStore::listPresets(Mode_Advanced, true).isEmpty());
    EXPECT_TRUE(CPresetStore::hasPresets());
}

TEST_F(CPresetStoreTest, AStoreThatCannotBeWrittenIsWarnedOfAndStopsNothing) {
    const QString path = openSettings().fileName();
    const auto warnings = [&path](const std::function<void()>& action) {
        const QStringList said = boxes(action);
        for (const QString& each : said)
            EXPECT_TRUE(each.startsWith("Warning|") && each.contains(path)) << qPrintable(each);
        return said.size();
    };
    const auto nobodyAsked = [this] {
        CPresetStore::ensureFactoryPresets(&pane);
        CBatchMode::instance().setBatchMode(Mode_Advanced);
        EXPECT_FALSE(save(CPresetStore::batchPresetName().toUtf8()));
    };
    ASSERT_TRUE(save("kept"));
    for (int time : {1, 2}) {
        QFile::remove(path);
        ASSERT_TRUE(QDir().mkpath(path));
        EXPECT_EQ(warnings(nobodyAsked), 1) << "of the first alone";
        EXPECT_EQ(warnings(nobodyAsked), 0);
        for (const char* name : {"x", "x"})
            EXPECT_EQ(warnings([&] { EXPECT_FALSE(save(name) || isNew); }), 1) << "asked for, so always";
        EXPECT_EQ(warnings([] { EXPECT_FALSE(CPresetStore::removePreset(Mode_Advanced, "x")); }), 1);
        EXPECT_FALSE(CPresetStore::hasPresets());
        ASSERT_TRUE(QDir().rmdir(path));
        EXPECT_EQ(warnings([&] { EXPECT_TRUE(save("x")) << time; }), 0);
    }
}

TEST_F(CPresetStoreTest, FactoryPresetsAreTheModesAsTheirPaneWouldSaveThem) {
    const auto lines = [] {
        const QSettings settings = openSettings();
        QStringList lines;
        for (const QString& key : settings.allKeys())
            lines << key + '=' + settings.value(key).toString();
        return lines;
    };
    Shown<CWgtPaneAdvancedImpl> shown(Mode_Advanced);
    CPresetStore::ensureFactoryPresets(&pane);
    const QStringList written = lines();
    const auto sliders = static_cast<int>(PaneTable::sliders(Mode_Advanced).size());
    EXPECT_EQ(written.size(), 12 * (sliders * 2 + 3));
    openSettings().clear();
    for (int number = Mode_Automatic; number < Mode_Advanced; ++number) {
        const CUserParamsPhotoshop factory(static_cast<EGUIMode>(number));
        const QString name = CPresetStore::factoryPresetName(static_cast<EGUIMode>(number));
        EXPECT_EQ(CPresetStore::factoryPresetMode(name), number);
        shown.pane->setSliders(name);
        CPresetStore::savePreset(shown.pane, Mode_Advanced, name, saved, isNew, false);
        CUserParams params;
        shown.pane->applyGUIParams(params);
        EXPECT_EQ(settingsOf(params.mSliderParams), settingsOf(factory.mSliderParams))
            << "as the command has it";
        shown.pane->setSliders("Automatic");
        CPresetStore::loadPreset(shown.pane, Mode_Advanced, name);
        shown.pane->applyGUIParams(params);
        EXPECT_EQ(settingsOf(params.mSliderParams), settingsOf(factory.mSliderParams)) << "from the store";
    }
    EXPECT_EQ(lines(), written);
    EXPECT_EQ(boxes([] {
                  EXPECT_EQ(CPresetStore::factoryPresetMode("portrait"), Mode_Portrait);
                  EXPECT_EQ(CPresetStore::factoryPresetName(Mode_Custom), QString(QChar(0xFFFF)));
              }),
              QStringList({"Note:|Unknown preset:portrait", "Note:|Unknown preset:13"}));
}

TEST_F(CPresetStoreTest, OneMissingFactoryPresetBringsAllBack) {
    const QString key = "2000/UserPresets/Advanced/Portrait/Sliders/sldrContrast_Perc/Value";
    CPresetStore::ensureFactoryPresets(&pane);
    openSettings().setValue(key, 1);
    CPresetStore::ensureFactoryPresets(&pane);
    EXPECT_EQ(openSettings().value(key).toDouble(), 1) << "none is missing";
    CPresetStore::removePreset(Mode_Advanced, "AutoSaturation");
    CPresetStore::ensureFactoryPresets(&pane);
    EXPECT_EQ(openSettings().value(key).toDouble(), 550);
    EXPECT_TRUE(CPresetStore::presetExists(Mode_Advanced, "AutoSaturation"));
}

} // namespace
