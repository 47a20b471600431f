// Modes that run without a dialogue: a window of progress and a stop button that closes by itself.

#include "GUI/Presets/CBatchMode.h"
#include "GUI/Windows/CDlgCustomPresetImpl.h"
#include "Settings/FactoryPresets.h"
#include "Settings/SettingsStore.h"
#include "Utility/CGenericEx.h"
#include "gui/Windows/ProcessingWindow.h"
#include "support/ModalDialog.h"

#include <QComboBox>

#include <gtest/gtest.h>

#include <algorithm>

using namespace orvela;

namespace {

class ProgressOnly : public testing::Test {
protected:
    // A run of Custom in which the user chooses that preset, or cancels.
    void runCustom(const QString& preset) {
        const ModalDialogs user([&](QDialog& dialog) {
            auto* chooser = qobject_cast<CDlgCustomPresetImpl*>(&dialog);
            if (!chooser)
                return;
            chooser->lstBxPreset->setCurrentText(preset);
            QTest::mouseClick(preset.isEmpty() ? chooser->btnCancel : chooser->btnOK, Qt::LeftButton);
        });
        custom.run();
    }

    // What is seen and holds nothing else that is.
    static QStringList seenIn(const QWidget& window) {
        QStringList seen;
        for (const QWidget* each : window.findChildren<QWidget*>()) {
            const auto parts = each->findChildren<QWidget*>();
            if (each->isVisible() && std::ranges::none_of(parts, &QWidget::isVisible))
                seen += each->objectName();
        }
        seen.sort();
        return seen;
    }

    ProcessingWindow custom{Mode_Custom, testplanes::noise(72, 48)};
};

TEST_F(ProgressOnly, CustomAppliesTheChosenPresetOrNothing) {
    SettingsEdit edit;
    PresetTree::write(edit, Mode_Advanced, QStringLiteral("Mine"), FactoryPresets::contentOf("Landscape"));
    edit.commit();
    runCustom(QString());
    EXPECT_FALSE(custom.window.appliesOnFinish());
    EXPECT_TRUE(custom.window.findChildren<CThreadedCore*>().isEmpty()) << "nothing was to be run";
    EXPECT_EQ(CBatchMode::instance().batchMode(), -1);

    runCustom(QStringLiteral("Mine"));
    EXPECT_EQ(custom.window.windowTitle(), "Applying custom advanced filter:Mine");
    EXPECT_TRUE(custom.window.appliesOnFinish());
    EXPECT_TRUE(testplanes::bytes(custom.output) ==
                custom.engineResult(CUserParamsPhotoshop(Mode_Landscape)));
    EXPECT_EQ(CBatchMode::instance().batchMode(), Mode_Advanced);
}

TEST_F(ProgressOnly, WithoutAnyPresetCustomTellsItsCallerAndAutomaticModesStillRun) {
    ProcessingWindow automatic(Mode_PortraitPro, testplanes::noise(72, 48));
    openSettings().clear(); // as when it could not be written
    EXPECT_THROW(custom.run(), CGenericEx);
    EXPECT_FALSE(custom.window.isVisible() || custom.window.appliesOnFinish());
    automatic.run();
    EXPECT_TRUE(testplanes::bytes(automatic.output) ==
                automatic.engineResult(CUserParamsPhotoshop(Mode_PortraitPro)));
}

TEST_F(ProgressOnly, ShowsProgressAndStopAloneAndIsStoppedByButtonKeyAndFrame) {
    const std::pair<const char*, void (*)(ProcessingWindow&)> ways[] = {
        {"button", [](ProcessingWindow& opened) { opened.click("btnStopProcessing"); }},
        {"key", [](ProcessingWindow& opened) { QTest::keyClick(&opened.window, Qt::Key_Escape); }},
        {"frame", [](ProcessingWindow& opened) { opened.window.close(); }},
    };
    for (const auto& [name, stop] : ways) {
        SCOPED_TRACE(name);
        ProcessingWindow opened(Mode_AutomaticPro, testplanes::noise(72, 48));
        opened.run([&, stop = stop] {
            EXPECT_EQ(seenIn(opened.window).join(' '), "btnStopProcessing prgBrCoreStatus");
            const auto* button = opened.find<QToolButton>("btnStopProcessing");
            EXPECT_EQ(button->text(), "Stop Processing");
            EXPECT_EQ(button->toolButtonStyle(), Qt::ToolButtonTextBesideIcon);
            stop(opened);
        });
        EXPECT_FALSE(opened.window.appliesOnFinish());
        EXPECT_NE(std::ranges::count(opened.core()->reports(), TaskOutcome::Cancelled, &TaskReport::outcome),
                  0)
            << "it was over before";
    }
}

} // namespace
