#include "module/ForeignHost.h"

#include <QThread>

using namespace orvela;

using ModuleLifeTest = ForeignHostTest;

namespace {

const QString kDone = QStringLiteral("run 1:0 2:0 3:0 5:0, stored 3, advanced 9");

// A number that the host's state has, such as that of "heap".
int number(const QString& state, const char* name) {
    const QStringList words = state.split(' ');
    return words.value(words.indexOf(QLatin1String(name)) + 1).toInt();
}

} // namespace

TEST_F(ModuleLifeTest, AStartGoesThroughItsStepsInOrder) {
    ASSERT_TRUE(QFile::copy(mModule, path("A.B.8bf")));
    ASSERT_TRUE(QDir(mFolder.path()).mkdir("Kestrand"));
    store("Kestrand/A.conf", "[General]\nNoThreads=2\n");
    mModule = path("A.B.8bf");
    EXPECT_EQ(host({"image 40 30 3 8 3 1", "call 2", "click press btnAutomatic", "call 3"}),
              QStringList({"call 2: 0", "buffer space 32400", "call 3: 0"}));
    EXPECT_TRUE(QString::fromUtf8(bytes("Kestrand/A.conf")).contains("Automatic")) << "its presets";
    EXPECT_FALSE(exists("Kestrand/Orvela.conf"));

    QStringList expected = {"\tSelector value is 3.",
                            "\t-> DoStart.",
                            "\t\tOrvelaApplication: default_num_threads: %1 noThreads:2",
                            "\t\tChecking for an update.",
                            "\t\tCreating Input CARGBPlanePhotoshop...",
                            "\t\tNow filling input plane from Photoshop data...",
                            "\t\tFillFrom_Photoshop_Data w=40 h=30",
                            "\t\tpInPlane w=40 h=30",
                            "\t\tCreating Output CARGBPlanePhotoshop...",
                            "\t\tNow starting the GUI...",
                            "\t\tSHIFT key state 0",
                            "\t\tNow outputting the result from CARGBPlanePhotoshop to Photoshop...",
                            "\t\tCARGBPlanePhotoshop::copyPlaneToPS iPlaneID:0",
                            "\t\tCARGBPlanePhotoshop::copyPlaneToPS iPlaneID:2",
                            "\t<- DoStart.",
                            "<- PluginMain."};
    expected[2] = expected[2].arg(QThread::idealThreadCount());
    const QStringList lines = log();
    qsizetype at = 0;
    for (const QString& line : expected) {
        const qsizetype found = lines.indexOf(line, at);
        EXPECT_GE(found, 0) << line.toStdString();
        at = std::max(at, found + 1);
    }
    EXPECT_EQ(at, lines.size()) << "and ends with them";
}

TEST_F(ModuleLifeTest, ALogOfStartHasNumbersOfThreads) {
    ASSERT_TRUE(QDir(mFolder.path()).mkdir("Kestrand"));
    for (const auto& [stored, logged] : {std::pair("", "noThreads:-1"),
                                         {"NoThreads=0\n", "noThreads:0"},
                                         {"NoThreads=3\n", "noThreads:3"}}) {
        store("Kestrand/Orvela.conf", QByteArray("[General]\n") + stored);
        EXPECT_EQ(host({"click press btnAutomatic", "run"}), QStringList({kDone}));
        EXPECT_EQ(log().filter(logged).size(), 1) << logged;
    }
}

// In one process, as hosts do that load a filter anew for every use.
TEST_F(ModuleLifeTest, LeavesNothingBehindWhenItIsUnloaded) {
    const QStringList once = {"click press btnAutomatic", "run"};
    QStringList commands = {"load " + mModule, "clicker " ORVELA_CLICKER, "image 64 48 3 8 3 1"};
    for (int run = 1; run <= 20; ++run) {
        commands += once;
        if (run == 5 || run == 20)
            commands += "state";
    }
    for (int life = 0; life < 5; ++life)
        commands += QStringList({"unload", "haunt", "state", "load " + mModule}) + once;
    const QStringList said = rawHost(commands);
    EXPECT_EQ(said.count(kDone), 25);
    EXPECT_EQ(said.count("unloaded"), 5);
    EXPECT_EQ(said.count("haunted"), 5);
    EXPECT_EQ(said.count("loaded"), 6);
    const QStringList states = said.filter("state");
    ASSERT_EQ(states.size(), 7);
    for (const QString& state : states)
        EXPECT_EQ(number(state, "threads"), 1) << state.toStdString();
    EXPECT_EQ(number(states[1], "files"), number(states[0], "files"));
    // The toolkit keeps the names of pictures that it had in its cache; a plane of this picture has 9 KB.
    EXPECT_LT(number(states[1], "heap") - number(states[0], "heap"), 100000);
    EXPECT_EQ(number(states[6], "files"), number(states[2], "files"));
    EXPECT_LT(number(states[6], "heap") - number(states[2], "heap"), 50000);
}

// No toolkit is in the process but that of the module itself.
TEST_F(ModuleLifeTest, NeedsNoToolkitOfTheHostAndLeavesItsSurroundings) {
    const QString load = "load " + mModule;
    EXPECT_EQ(rawHost({load, "surroundings", "call 1", "elsewhere 9", "surroundings", "unload", "haunt", load,
                       "call 1", "unload", "surroundings"}),
              QStringList({"loaded", "locale C, platform offscreen", "call 1: 0", "call 9: -30100",
                           "locale C, platform offscreen", "unloaded", "haunted", "loaded", "call 1: 0",
                           "unloaded", "locale C, platform offscreen", "end"}));
}

TEST_F(ModuleLifeTest, AHostWithTheSameToolkitKeepsWhatIsItsOwn) {
    const QString names = "host|Host Makers|host.example|Host|C|QLabel { color: red }|the host's Automatic|0";
    const QStringList tells = {names, "the host hears the host's own"};
    EXPECT_EQ(host({"host tell", "call 1", "host tell", "click press btnAutomatic", "run", "host tell",
                    "click press btnAdvanced", "click press btnOK", "run", "unload", "host tell",
                    "load " + mModule, "call 1", "host tell", "host end", "call 3", "call 1"},
                   {"clicker " ORVELA_CLICKER, "host begin"}),
              tells + QStringList("call 1: 0") + tells + QStringList(kDone) + tells +
                  QStringList({kDone, "still loaded"}) + tells + QStringList("call 1: 0") + tells +
                  QStringList({"call 3: -128", "call 1: 0"}));
    EXPECT_TRUE(exists("Kestrand/Orvela.conf"));
    EXPECT_FALSE(exists("Host Makers"));
}
