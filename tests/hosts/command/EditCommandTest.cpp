#include "Settings/ModeTable.h"
#include "hosts/command/ProgramRun.h"

using namespace orvela;

namespace {

/// Runs `orvela edit` without a display, for a user with settings of his own who speaks German.
class EditCommand : public ProgramTest {
protected:
    EditCommand() {
        mEnvironment.insert(QStringLiteral("XDG_CONFIG_HOME"), path("settings"));
        mEnvironment.insert(QStringLiteral("LC_ALL"), QStringLiteral("de_DE.UTF-8"));
        mEnvironment.insert(QStringLiteral("ORVELA_TMP_FILE"), path("orvela.log"));
        sample("a.png");
    }

    Answer edit(const char* arguments) {
        QProcess process;
        process.setProcessEnvironment(mEnvironment);
        begin(process, (std::string("edit ") + arguments).c_str());
        return finish(process);
    }

    // What the next starts are to replay without a window.
    void setBatchMode(EGUIMode mode) const {
        QDir(mFolder.path()).mkpath(QStringLiteral("settings/Kestrand"));
        store("settings/Kestrand/Orvela.conf",
              "[2000]\nGUI\\batchModeEnabled=true\nGUI\\batchMode=" + QByteArray::number(int(mode)) + "\n");
    }

    QProcessEnvironment mEnvironment = QProcessEnvironment::systemEnvironment();
};

} // namespace

TEST_F(EditCommand, GivesThePictureOfTheCommandInEveryModeThatIsReplayed) {
    int compared = 0;
    for (const ModeDescription& mode : ModeTable::all()) {
        if (!mode.presetName)
            continue;
        const std::string name = std::string("\"") + mode.displayName + '"';
        setBatchMode(mode.mode);
        EXPECT_EQ(orvela(("enhance a.png --mode " + name + " -o command.png --force").c_str()).status, 0);
        const Answer answer = edit("a.png -o windows.png --force");
        EXPECT_EQ(answer.status, 0) << name << answer.err;
        EXPECT_EQ(answer.out, "a.png -> windows.png\n");
        EXPECT_FALSE(bytes("windows.png").isEmpty());
        EXPECT_EQ(bytes("windows.png"), bytes("command.png")) << name;
        ++compared;
    }
    EXPECT_EQ(compared, 12);
    EXPECT_TRUE(bytes("orvela.log").contains("-> DoStart."));
}

TEST_F(EditCommand, RefusesBeforeAnyWindowOpens) {
    EXPECT_EQ(edit("").status, 2);
    EXPECT_EQ(edit("a.png -o a.png --force").status, 2);
    EXPECT_EQ(edit("a.png -o a.gif").status, 2);
    const Answer missing = edit("b.png");
    EXPECT_EQ(missing.status, 1);
    EXPECT_TRUE(missing.says("b.png: ")) << missing.err;
    store("taken.png", "mine");
    EXPECT_EQ(edit("a.png -o taken.png").status, 4);
    EXPECT_EQ(bytes("taken.png"), "mine");
}

TEST_F(EditCommand, TellsWhereThereIsNoDisplay) {
    for (const char* name : {"QT_QPA_PLATFORM", "DISPLAY", "WAYLAND_DISPLAY"})
        mEnvironment.remove(QString::fromLatin1(name));
    mEnvironment.insert(QStringLiteral("XDG_RUNTIME_DIR"), mFolder.path());
    const Answer answer = edit("a.png");
    EXPECT_EQ(answer.status, 1);
    EXPECT_TRUE(answer.says("a.png: there is no display for windows")) << answer.err;
    EXPECT_EQ(files(), QStringList({"a.png"}));
}

// Started by hand, or without the picture that it is told of.
TEST_F(EditCommand, HasWindowsThatRefuseWhatIsNoSharedPicture) {
    const QString windows =
        QFileInfo(QStringLiteral(ORVELA_PROGRAM)).path() + QStringLiteral("/orvela-windows");
    for (const char* arguments : {"", "1 picture", "1 picture 0", "x y z"}) {
        QProcess process;
        begin(process, arguments, windows.toUtf8());
        EXPECT_NE(finish(process).status, 0) << arguments;
    }
}
