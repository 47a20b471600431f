#include "command/EnhanceCommand.h"

#include "ProgramRun.h"
#include "hosts/FailingNew.h"
#include "hosts/TestFiles.h"

#include <sys/resource.h>

#include <cstdlib>
#include <iostream>
#include <map>
#include <sstream>

using namespace orvela;

namespace {

#if !defined(__SANITIZE_ADDRESS__) && !defined(__SANITIZE_THREAD__) // they need more than any limit
class LimitedMemoryTest : public ProgramTest {
protected:
    Answer orvelaWithin(rlim_t bytes, const char* arguments) {
        QProcess process;
        process.setChildProcessModifier([bytes] {
            const rlimit limit = {bytes, bytes};
            setrlimit(RLIMIT_AS, &limit);
        });
        begin(process, arguments);
        return finish(process);
    }
};

TEST_F(LimitedMemoryTest, WantOfMemoryHasItsOwnStatusAndDoesNotKeepTheOthers) {
    sample("good.png");
    // 30000 x 30000 pixels in packed rows, in a file that could hold them.
    store("huge.psd", QByteArray::fromHex("38425053000100000000000000030000753000007530000800030000"
                                          "000000000000000000000001") +
                          QByteArray(15'000'000, '\0'));
    const Answer answer = orvelaWithin(2'000'000'000, "enhance missing.png huge.psd good.png");
    EXPECT_EQ(answer.status, 5);
    EXPECT_TRUE(answer.says("huge.psd: its 30000 x 30000 pixels need about ")) << answer.err;
    EXPECT_TRUE(exists("good-enhanced.png"));
}

// Codecs that start threads of their own, and the JPEG library's own memory: a progressive file whose head
// claims more pixels needs three times as much for its coefficients as for its samples.
TEST_F(LimitedMemoryTest, CodecsDoNotEndTheProgram) {
    sample("good.png");
    const std::string make =
        "cd " + mFolder.path().toStdString() +
        " && convert -size 4000x3000 gradient:red-blue flat.jpg && "
        "vips heifsave flat.jpg flat.heic && convert good.png -interlace JPEG claims.jpg && "
        "python3 -c \"b=bytearray(open('claims.jpg','rb').read()); f=b.find(b'\\xff\\xc2'); "
        "b[f+5:f+9]=b'\\x1b\\x58\\x1b\\x58'; open('claims.jpg','wb').write(b)\"";
    ASSERT_EQ(std::system(make.c_str()), 0);
    for (const rlim_t megabytes : {230, 260, 300}) {
        const Answer answer = orvelaWithin(megabytes << 20, "enhance --force flat.heic good.png");
        EXPECT_EQ(answer.status, 5) << megabytes;
        EXPECT_TRUE(answer.says("flat.heic: its 4000 x 3000 pixels need about 214 MB")) << answer.err;
        EXPECT_TRUE(answer.says("good.png -> good-enhanced.png")) << answer.err;
    }
    const Answer written = orvelaWithin(480U << 20, "enhance flat.jpg -o flat-new.heic");
    EXPECT_EQ(written.status, 5) << written.err;
    EXPECT_FALSE(exists("flat-new.heic"));
    const Answer claimed = orvelaWithin(700U << 20, "enhance claims.jpg");
    EXPECT_EQ(claimed.status, 5) << claimed.err;
}
#endif

// Each larger allocation of the whole command fails once, with every kind of exception: the photograph that
// it hits fails, with a status of its kind, and the other one is done.
TEST(EnhanceCommand, ASurpriseAnywhereCostsOnePhotograph) {
    const TestFolder folder;
    folder.run("convert $S/coffee.png -resize 24x16! a.png && convert a.png b.tif");
    EnhanceOptions options;
    options.photographs = {(folder / "a.png").string(), (folder / "b.tif").string()};
    options.targets.folder = folder / "out";
    options.settings.mode = "PortraitPro";
    options.writing.overwrite = options.quiet = true;
    options.threads = 1;
    sigset_t unblocked;
    pthread_sigmask(SIG_SETMASK, nullptr, &unblocked);
    StopSignals signals;
    std::ostringstream said;
    std::streambuf* const errors = std::cerr.rdbuf(said.rdbuf());
    const std::pair<ExitStatus, std::function<void()>> kinds[] = {
        {ExitStatus::OutOfMemory, [] { throw std::bad_alloc(); }},
        {ExitStatus::PhotographFailed, [] { throw std::runtime_error("a surprise"); }},
        {ExitStatus::PhotographFailed, [] { throw 42; }}};
    for (const auto& [expected, failure] : kinds) {
        std::map<ExitStatus, int> seen;
        bool happened = true;
        for (long n = 1; happened; ++n) {
            std::filesystem::remove_all(folder / "out");
            const FailingNew failing(1000, n, failure);
            try {
                const ExitStatus status = enhancePhotographs(options, signals);
                ++seen[status];
                EXPECT_GE(std::filesystem::exists(folder / "out/a.png") +
                              std::filesystem::exists(folder / "out/b.tif"),
                          status == ExitStatus::Done ? 2 : 1)
                    << n;
            } catch (...) { // before there was a batch
                ++seen[ExitStatus::WrongUsage];
            }
            happened = FailingNew::happened();
        }
        EXPECT_GT(seen[expected], 50) << static_cast<int>(expected);
    }
    std::cerr.rdbuf(errors);
    pthread_sigmask(SIG_SETMASK, &unblocked, nullptr);
    EXPECT_NE(said.str().find("b.tif: a surprise\n"), std::string::npos);
    EXPECT_NE(said.str().find("a.png: failed for an unknown reason; report this\n"), std::string::npos);
}

} // namespace
