// Preset files dropped on the processing window and its previews.

#include "Settings/PresetFile.h"
#include "gui/Windows/RunsFixture.h"
#include "support/ModalDialog.h"

#include <gmock/gmock.h>

using namespace orvela;

namespace {

// What the boxes say that the drop brings.
std::string dropSays(QWidget* at, const QList<QUrl>& urls) {
    const QStringList said = messageBoxes([&] {
        ASSERT_TRUE(drop(at, urls));
        QTest::qWait(1);
    });
    return said.join(QLatin1Char('+')).toStdString();
}

using PresetDrop = Runs;

TEST_F(PresetDrop, GivesWhatTheFileSaysAndCanBeUndone) {
    CUserParamsPhotoshop wanted(Mode_LandscapePro);
    wanted.mSliderParams.SaturationValue = 612.3456F; // no number that the control shows
    PresetFile preset;
    preset.take(wanted.mSliderParams);
    const QUrl mine = file(preset.text());
    opened.run([&] {
        const PresetContent before = controls();
        EXPECT_EQ(dropSays(block()->txtValue, {mine}), "");
        const PresetContent after = controls();
        EXPECT_NE(after, before);
        QTest::keyClick(&opened.window, Qt::Key_Z, Qt::ControlModifier);
        EXPECT_EQ(controls(), before);
        EXPECT_EQ(dropSays(opened.views()[0]->viewport(), {mine}), "");
        EXPECT_EQ(controls(), after);
        opened.click("btnOK");
    });
    EXPECT_EQ(testplanes::bytes(opened.output), opened.engineResult(wanted));
}

class PresetDropOnThreeSliders : public Runs {
protected:
    PresetDropOnThreeSliders() : Runs(Mode_Adjustments) {}
};

TEST_F(PresetDropOnThreeSliders, RefusesAnythingElseWithAReasonAndChangesNothing) {
    const QUrl good = file(R"({"version": 1, "settings": {"SaturationEnabled": true}})", "good.json");
    const QUrl flash = file(R"({"version": 1, "settings": {"DigitalFlashEnabled": true}})", "flash.json");
    opened.run([&] {
        const PresetContent before = controls();
        const std::pair<QList<QUrl>, const char*> cases[] = {
            {{file("\xff\xd8\xff", "photo.jpg")}, "photo.jpg: is not JSON"},
            {{file(QByteArray(4'000'001, ' '), "large.json")}, "large.json: is larger than 4 MB"},
            {{QUrl::fromLocalFile(mFolder.filePath("missing.json"))}, "missing.json: is not a file"},
            {{QUrl::fromLocalFile(mFolder.path())}, ": is not a file"},
            {{good, good}, "Only one preset file"},
            {{QUrl("https://host.example/good.json")}, "Only one preset file"},
            {{flash}, "flash.json: holds nothing that these sliders can show (Digital Flash)"},
        };
        for (const auto& [urls, reason] : cases) {
            EXPECT_THAT(dropSays(&opened.window, urls), testing::HasSubstr(reason));
            EXPECT_EQ(controls(), before) << reason;
        }
        opened.click("btnCancel");
    });
}

TEST_F(PresetDropOnThreeSliders, TellsWhatTheWindowHasNoSliderFor) {
    const QUrl both = file(R"({"version": 1, "settings":
        {"DigitalFlashEnabled": true, "SaturationEnabled": true, "SaturationValue": 700}})");
    opened.run([&] {
        block("sldr2")->setEnabled(true);
        const double light = block("sldr2")->exactValue();
        EXPECT_EQ(dropSays(&opened.window, {both}),
                  "Information|dropped.json was loaded without what this window has no slider for: "
                  "Digital Flash");
        EXPECT_TRUE(block("sldr1")->isEnabled());
        EXPECT_EQ(block("sldr1")->exactValue(), 700);
        EXPECT_FALSE(block("sldr2")->isEnabled());
        EXPECT_EQ(block("sldr2")->exactValue(), light);
        opened.click("btnCancel");
    });
}

} // namespace
