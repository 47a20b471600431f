#include "Settings/ModeTable.h"
#include "hosts/command/ProgramRun.h"

using namespace orvela;

namespace {

/// Runs the windows' host without a display, for a user who speaks German.
class EditTest : public ProgramTest {
protected:
    Answer edit(const char* arguments) {
        QProcess process;
        QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
        environment.insert(QStringLiteral("QT_QPA_PLATFORM"), QStringLiteral("offscreen"));
        environment.insert(QStringLiteral("XDG_CONFIG_HOME"), path("settings"));
        environment.insert(QStringLiteral("LC_ALL"), QStringLiteral("de_DE.UTF-8"));
        process.setProcessEnvironment(environment);
        begin(process, arguments, ORVELA_EDIT_PROGRAM);
        return finish(process);
    }
};

} // namespace

TEST_F(EditTest, GivesThePictureOfTheCommandInEveryModeWithoutDialogue) {
    sample("a.png");
    int compared = 0;
    for (const ModeDescription& mode : ModeTable::all()) {
        if (!mode.presetName)
            continue;
        const std::string name = std::string("\"") + mode.displayName + '"';
        EXPECT_EQ(orvela(("enhance a.png --mode " + name + " -o command.png --force").c_str()).status, 0);
        EXPECT_EQ(edit(("a.png --mode " + name + " -o windows.png --force").c_str()).status, 0) << name;
        EXPECT_FALSE(bytes("windows.png").isEmpty());
        EXPECT_EQ(bytes("windows.png"), bytes("command.png")) << name;
        ++compared;
    }
    EXPECT_EQ(compared, 12);
}

TEST_F(EditTest, RefusesBeforeAnyWindowOpens) {
    sample("a.png");
    EXPECT_EQ(edit("").status, 2);
    EXPECT_EQ(edit("a.png --mode Nothing").status, 2);
    const Answer missing = edit("b.png --mode Automatic -o c.png");
    EXPECT_EQ(missing.status, 1);
    EXPECT_TRUE(missing.says("b.png: ")) << missing.err;
    const Answer onItself = edit("a.png --mode Automatic -o a.png --force");
    EXPECT_EQ(onItself.status, 1);
    EXPECT_EQ(files(), QStringList({"a.png"}));
}
