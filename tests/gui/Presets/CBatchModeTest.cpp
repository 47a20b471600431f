#include "GUI/Presets/CBatchMode.h"

#include "Platform/Keyboard.h"
#include "Settings/EGUIMode.h"
#include "Settings/SettingsStore.h"
#include "support/BoxAnswer.h"
#include "support/LogCapture.h"

using namespace orvela;

TEST(CBatchMode, ShiftSwitchesItOff) {
    struct Started : CBatchMode {};
    openSettings().clear();
    EXPECT_EQ(CBatchMode::instance().batchMode(), -1);
    EXPECT_FALSE(CBatchMode::instance().isBatchModeEnabled());
    CBatchMode::instance().setBatchModeEnabled(true);
    CBatchMode::instance().setBatchMode(Mode_SmartLevels);
    LogCapture log;
    EXPECT_TRUE(Started().isBatchModeEnabled());
    EXPECT_TRUE(log.has("SHIFT key state 0"));
    Keyboard::setShiftState([] { return 128; });
    QString said;
    answerBox(QMessageBox::Ok, said);
    EXPECT_FALSE(Started().isBatchModeEnabled());
    Keyboard::setShiftState(nullptr);
    EXPECT_TRUE(log.has("SHIFT key state 128"));
    EXPECT_EQ(said, "Batch Mode|Batch mode is now off.");
    EXPECT_EQ(CBatchMode::instance().batchMode(), 32);
    EXPECT_EQ(openSettings().value("2000/GUI/batchModeEnabled"), QVariant(false));
}
