#include "module/ForeignHost.h"

using namespace orvela;

using SelectorsTest = ForeignHostTest;

TEST_F(SelectorsTest, ThoseWithoutWorkLogThatTheyWereSent) {
    EXPECT_EQ(host({"call 1", "call 5"}), QStringList({"call 1: 0", "call 5: 0"}));
    EXPECT_EQ(log(), QStringList({"-> PluginMain.", "\tSelector value is 1.", "<- PluginMain.",
                                  "-> PluginMain.", "\tSelector value is 5.", "<- PluginMain."}));
}

TEST_F(SelectorsTest, PrepareAsksForMemory) {
    EXPECT_EQ(host({"image 100 50 3 8 3 1", "call 2", "rect 10 20 30 60", "call 2",
                    "image 20000 20000 1 8 1 1", "call 2"}),
              QStringList({"call 2: 0", "buffer space 135000", "call 2: 0", "buffer space 21600", "call 2: 0",
                           "buffer space 2147483647"})); // 10.8 billion
    EXPECT_EQ(log().filter("Memory"), QStringList({"\tMemory info: Allowed=123456789, Needed=45000",
                                                   "\tMemory info: Allowed=123456789, Needed=7200",
                                                   "\tMemory info: Allowed=123456789, Needed=2147483647"}));
}

TEST_F(SelectorsTest, AboutShowsTheProgramsInformations) {
    EXPECT_EQ(host({"click watch", "click press Close", "call 0", "click close", "call 0"}),
              QStringList({"shown: CDlgProgramInfos", "call 0: 0", "call 0: 0"}));
}

TEST_F(SelectorsTest, InvalidOnesAreToldInABox) {
    const QString again = "An invalid selector was passed by Photoshop (filterSelectorContinue).";
    const QString ninth = "An invalid selector was passed by Photoshop: 9";
    const QString negative = "An invalid selector was passed by Photoshop: -7";
    EXPECT_EQ(
        host({"click box OK", "call 4", "click box OK", "call 9", "click box OK", "call -7", "call 5"}),
        QStringList({criticalBox(again, again), "call 4: 0", criticalBox(ninth, ninth), "call 9: -30100",
                     criticalBox(negative, negative), "call -7: -30100", "call 5: 0"}));
    // The failure is logged, once: the box has told it.
    const QStringList lines = log();
    EXPECT_EQ(lines.mid(0, 6).join('\n').toStdString(),
              "-> PluginMain.\n\tSelector value is 4.\n\t-> Exception Stack:\n"
              "\t\t Unknown File:0 CGenericEx " +
                  again.toStdString() + "\n\t<- End Stack.\n<- PluginMain.");
    EXPECT_EQ(lines.filter(again).size(), 1);
    EXPECT_EQ(lines.filter(QRegularExpression("PluginMain:\\d+ CGenericEx " + ninth)).size(), 1);
}

TEST_F(SelectorsTest, AnotherThreadThanThatOfTheWindowsIsRefused) {
    EXPECT_EQ(host({"elsewhere 0", "elsewhere 3", "elsewhere 9", "click press btnAutomatic", "run"}),
              QStringList({"call 0: 0", "call 3: -128", "call 9: -30100",
                           "run 1:0 2:0 3:0 5:0, stored 3, advanced 9"}));
    EXPECT_EQ(log().filter("No window can be opened for: ").size(), 3);
}

TEST_F(SelectorsTest, NoDisplayIsAnAnswerAndNotAnEnd) {
    for (const char* platform : {"", "xcb", "wayland", "eglfs", "nothing;xcb:x"}) {
        SCOPED_TRACE(platform);
        mEnvironment.insert("QT_QPA_PLATFORM", platform);
        EXPECT_EQ(host({"call 1", "call 2", "call 3", "call 0", "call 4", "call 9", "call 5", "unload"}),
                  QStringList({"call 1: 0", "call 2: 0", "buffer space 82944", "call 3: -128", "call 0: 0",
                               "call 4: 0", "call 9: -30100", "call 5: 0", "unloaded"}));
        EXPECT_EQ(log().filter("No window can be opened for: ").size(), 4);
        EXPECT_EQ(log().filter("(No window can be opened here.)").size(), 2);
    }
}

TEST_F(SelectorsTest, TheLogGoesWhereTheEnvironmentSaysAtTheFirstCall) {
    ASSERT_TRUE(QDir(mFolder.path()).mkdir("other"));
    EXPECT_EQ(host({"env TMP " + path("other"), "call 1", "env ORVELA_TMP_FILE " + path("late.log"), "call 1",
                    "unload", "load " + mModule, "call 1"}),
              QStringList({"call 1: 0", "call 1: 0", "unloaded", "call 1: 0"}));
    EXPECT_EQ(log("other/orvela.log").filter("Selector value is 1.").size(), 2);
    EXPECT_EQ(log("late.log").filter("Selector value is 1.").size(), 1);
    EXPECT_FALSE(exists("orvela.log"));
    // Neither: the user's own place. A log that cannot be written stops nothing.
    EXPECT_EQ(host({"env TMP", "call 1"}), QStringList({"call 1: 0"}));
    EXPECT_EQ(log("Kestrand/orvela.log").size(), 3);
    EXPECT_EQ(host({"env ORVELA_TMP_FILE " + path("nowhere/a.log"), "call 1"}), QStringList({"call 1: 0"}));
}
