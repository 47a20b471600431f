#include "ProgramRun.h"

#include <sys/resource.h>
#include <unistd.h>

using namespace orvela;

namespace {

class EnhanceCommandTest : public ProgramTest {};

TEST_F(EnhanceCommandTest, TheResultStandsBesideThePhotographAndIsNamed) {
    sample("a.png");
    const Answer answer = orvela("enhance a.png");
    EXPECT_EQ(answer.status, 0);
    EXPECT_EQ(answer.out, "a.png -> a-enhanced.png\n");
    EXPECT_EQ(answer.err, "");
    EXPECT_NE(bytes("a-enhanced.png"), bytes("a.png"));
    EXPECT_EQ(files(), QStringList({QStringLiteral("a-enhanced.png"), QStringLiteral("a.png")}));
}

TEST_F(EnhanceCommandTest, TheFormatFollowsTheContentAndQuietSaysNothing) {
    sample("a.jpg");
    const Answer answer = orvela("enhance --quiet a.jpg -d new/out");
    EXPECT_EQ(answer.status, 0);
    EXPECT_EQ(answer.out + answer.err, "");
    EXPECT_TRUE(bytes("new/out/a.png").startsWith("\x89PNG"));
}

TEST_F(EnhanceCommandTest, AFailedPhotographDoesNotKeepTheOthers) {
    sample("good.png");
    store("empty.png", "");
    store("text.png", "no picture at all");
    store("cut.png", bytes("good.png").left(2000));
    const Answer answer = orvela("enhance missing.png empty.png text.png cut.png good.png");
    EXPECT_EQ(answer.status, 1);
    for (const char* name : {"missing.png: ", "empty.png: ", "text.png: ", "cut.png: "})
        EXPECT_TRUE(answer.says(name)) << answer.err;
    EXPECT_EQ(std::count(answer.err.begin(), answer.err.end(), '\n'), 4);
    EXPECT_TRUE(exists("good-enhanced.png"));
    EXPECT_EQ(files().size(), 5);
}

#if !defined(__SANITIZE_ADDRESS__) && !defined(__SANITIZE_THREAD__) // they need more than any limit
TEST_F(EnhanceCommandTest, WantOfMemoryHasItsOwnStatusAndDoesNotKeepTheOthers) {
    sample("good.png");
    // 30000 x 30000 pixels in packed rows.
    store("huge.psd", QByteArray::fromHex("38425053000100000000000000030000753000007530000800030000"
                                          "000000000000000000000001") +
                          QByteArray(2 * 3 * 30000, '\0'));
    QProcess process;
    process.setChildProcessModifier([] {
        const rlimit limit = {2'000'000'000, 2'000'000'000};
        setrlimit(RLIMIT_AS, &limit);
    });
    begin(process, "enhance missing.png huge.psd good.png");
    const Answer answer = finish(process);
    EXPECT_EQ(answer.status, 5);
    EXPECT_TRUE(answer.says("huge.psd: not enough memory; ")) << answer.err;
    EXPECT_TRUE(exists("good-enhanced.png"));
}
#endif

TEST_F(EnhanceCommandTest, ExistingResultsStayUnlessForced) {
    sample("a.png");
    sample("b.png");
    store("a-enhanced.png", "old");
    const Answer kept = orvela("enhance a.png b.png");
    EXPECT_EQ(kept.status, 4);
    EXPECT_TRUE(kept.says("--force"));
    EXPECT_EQ(bytes("a-enhanced.png"), "old");
    EXPECT_TRUE(exists("b-enhanced.png"));
    EXPECT_EQ(orvela("enhance a.png --force").status, 0);
    EXPECT_EQ(bytes("a-enhanced.png"), bytes("b-enhanced.png"));
}

TEST_F(EnhanceCommandTest, PhotographsThatAreReadAreNeverOverwritten) {
    sample("a.png");
    sample("b.png");
    const QByteArray before = bytes("a.png");
    ASSERT_EQ(symlink("a.png", qPrintable(path("link.png"))), 0);
    ASSERT_EQ(link(qPrintable(path("a.png")), qPrintable(path("hard.png"))), 0);
    for (const char* arguments :
         {"enhance a.png -o a.png --force", "enhance a.png -o ./link.png --force",
          "enhance a.png -o hard.png --force", "enhance a.png b.png -d . --force",
          "enhance a.png -o x.png --log a.png", "enhance a.png -o x.png --save-preset a.png"})
        EXPECT_EQ(orvela(arguments).status, 2) << arguments;
    EXPECT_EQ(bytes("a.png"), before);
    EXPECT_FALSE(exists("x.png"));
}

TEST_F(EnhanceCommandTest, TwoSourcesWithOneTargetAreRefusedBeforeAnyWork) {
    sample("one/a.png");
    sample("two/a.png");
    const Answer answer = orvela("enhance one/a.png two/a.png -d out");
    EXPECT_EQ(answer.status, 2);
    EXPECT_TRUE(answer.says("one/a.png and two/a.png"));
    EXPECT_FALSE(exists("out"));
    EXPECT_EQ(orvela("enhance one/a.png two/a.png -o x.png").status, 2);
    EXPECT_EQ(orvela("enhance one/a.png ./one/../one/a.png").status, 0); // one photograph, named twice
}

TEST_F(EnhanceCommandTest, FoldersAndPatternsStandForTheirPhotographs) {
    sample("in/a.png");
    sample("in/B.PNG");
    store("in/notes.txt", "x");
    QDir(mFolder.path()).mkpath(path("none"));
    EXPECT_EQ(orvela("enhance in").out, "in/B.PNG -> in/B-enhanced.PNG\nin/a.png -> in/a-enhanced.png\n");
    EXPECT_EQ(orvela("enhance in --force").status, 0);
    EXPECT_EQ(files("in").size(), 5); // results are no photographs of the folder
    EXPECT_EQ(orvela("enhance none").status, 3);
    EXPECT_EQ(orvela("enhance q*.png").status, 3);
    EXPECT_EQ(orvela("enhance in/a.p?g q*.png -o x.png").status, 3);
    EXPECT_TRUE(exists("x.png"));
}

TEST_F(EnhanceCommandTest, WrongUsageIsRefusedAndHelpIsNot) {
    sample("a.png");
    for (const char* arguments :
         {"", "enhance", "bogus", "enhance a.png --bogus", "enhance a.png --threads 0",
          "enhance a.png --quality 101", "enhance a.png -o x.png -d y"})
        EXPECT_EQ(orvela(arguments).status, 2) << arguments;
    for (const char* arguments : {"--help", "--version", "enhance --help", "modes --help"}) {
        const Answer answer = orvela(arguments);
        EXPECT_EQ(answer.status, 0) << arguments;
        EXPECT_NE(answer.out, "") << arguments;
        EXPECT_EQ(answer.err, "") << arguments;
    }
    EXPECT_EQ(files(), QStringList(QStringLiteral("a.png")));
}

TEST_F(EnhanceCommandTest, UnwritableTargetsAreTargetTrouble) {
    sample("a.png");
    store("file", "x");
    for (const char* arguments :
         {"enhance a.png -o none/x.png", "enhance a.png -d file", "enhance a.png -o x.png --log none/log",
          "enhance a.png --save-preset none/p", "enhance a.png -o x.png --trace file"})
        EXPECT_EQ(orvela(arguments).status, 4) << arguments;
    EXPECT_EQ(files(), QStringList({QStringLiteral("a.png"), QStringLiteral("file")}));
    EXPECT_EQ(orvela("enhance a.png -o x.psd").status, 1);
}

// A link that leads to itself is neither a folder nor a file.
TEST_F(EnhanceCommandTest, LoopsOfLinksAreNamed) {
    sample("a.png");
    for (const char* name : {"x", "y.png", "z.png"})
        ASSERT_EQ(symlink(name, qPrintable(path(name))), 0);
    for (const char* arguments : {"enhance a.png -o r.png --trace x", "enhance a.png -o r.png --trace x/t",
                                  "enhance a.png -d x", "enhance a.png -o r.png --log x"}) {
        const Answer answer = orvela(arguments);
        EXPECT_EQ(answer.status, 4) << arguments;
        EXPECT_TRUE(answer.says("orvela: x") && answer.says("; ")) << answer.err;
    }
    const Answer sources = orvela("enhance y.png z.png .");
    EXPECT_EQ(sources.status, 1);
    EXPECT_TRUE(sources.says("y.png: ") && sources.says("z.png: ")) << sources.err;
    EXPECT_TRUE(exists("a-enhanced.png"));
}

} // namespace
