#include "ProgramRun.h"

#include <sys/resource.h>

#include <cstdlib>

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

} // namespace
