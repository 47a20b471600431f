#include "module/ForeignHost.h"

using namespace orvela;

namespace {

/// A screen of its own with a window manager, and the system's pointer and keyboard.
class OnScreenTest : public ForeignHostTest {
protected:
    OnScreenTest() {
        mEnvironment.remove("QT_QPA_PLATFORM");
        mProgram = QStringList({"xvfb-run", "-a", "-s", "-screen 0 1280x800x24", "sh", "-c",
                                "openbox --sm-disable >&2 & exec \"$0\"", ORVELA_FOREIGN_HOST});
    }
};

const QString kDone = QStringLiteral("run 1:0 2:0 3:0 5:0, stored 3, advanced 9");

} // namespace

TEST_F(OnScreenTest, TheUsersPointerAndShiftKeyCount) {
    const QString enabled = "box: Batch Mode Enabled|";
    const QString off = "box: Batch Mode|Batch mode is now off.|information|OK";
    const QString cancelled = "run 1:0 2:0 3:-128, stored 0, advanced 4";
    QStringList said = host(
        {"surroundings",
         // A click of the pointer on the main window, in batch mode from now on.
         "click press btnToggleBatchMode", "click box OK", "click aim btnAutoLevels", "run",
         // The key is looked at in the first start of the module's life alone.
         "shell xdotool keydown shift", "click watch", "run", "shell xdotool keyup shift", "unload", "haunt",
         "state", "load " + mModule, "shell xdotool keydown shift", "click watch", "click box OK",
         "click close", "run", "shell xdotool keyup shift", "click watch", "click close", "run", "unload",
         "haunt", "load " + mModule, "click press btnAutoLevels", "run", "unload", "haunt", "state"});
    const QStringList states = said.filter("state ");
    for (const QString& line : QStringList({"haunted"}) + states)
        said.removeAll(line);
    EXPECT_EQ(said.takeFirst(), "locale C, platform none");
    EXPECT_TRUE(said.value(0).startsWith(enabled)) << said.value(0).toStdString();
    EXPECT_EQ(said.mid(1), QStringList({kDone, "shown: CDlgSettings", kDone, "unloaded", "shown: QMessageBox",
                                        off, "shown: CDlgMain", cancelled, "shown: CDlgMain", cancelled,
                                        "unloaded", kDone, "unloaded"}));
    // A thread of the toolkit's stays, which no second life of the module adds to.
    ASSERT_EQ(states.size(), 2);
    EXPECT_EQ(states[0].section(" heap", 0, 0), states[1].section(" heap", 0, 0));
    EXPECT_TRUE(QString::fromUtf8(bytes("Kestrand/Orvela.conf")).contains("batchModeEnabled=false"));
    EXPECT_EQ(log().filter(QRegularExpression("SHIFT key state 0$")).size(), 1); // of the last life
}
