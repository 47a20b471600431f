#include "command/Sources.h"

#include "hosts/TestFiles.h"

#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

using namespace orvela;

namespace {

TEST(Sources, TellWhichFolderCannotBeReadAndKeepTheOthers) {
    const TestFolder folder;
    folder.run("chmod 755 . && mkdir open closed && touch open/a.png closed/b.png && chmod 0 closed");
    const pid_t child = ::fork();
    if (child == 0) {
        const bool changed = ::getuid() != 0 || ::setuid(65534) == 0;
        const Sources found = findSources({(folder / "closed").string(), (folder / "open").string()});
        const bool told =
            found.failures.size() == 1 && found.failures[0].starts_with((folder / "closed").string());
        ::_exit(changed && told && found.unmatched.empty() && found.photographs.size() == 1 ? 0 : 1);
    }
    int status = -1;
    ::waitpid(child, &status, 0);
    EXPECT_EQ(status, 0);
    folder.run("chmod 700 closed");
}

} // namespace
