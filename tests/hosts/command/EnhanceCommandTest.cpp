#include "ProgramRun.h"

#include <sys/resource.h>

using namespace orvela;

namespace {

class EnhanceCommandTest : public ProgramTest {};

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

} // namespace
