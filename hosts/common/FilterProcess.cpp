#include "common/FilterProcess.h"

#include "Platform/FilterRecord.h"

#include <signal.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <cstring>

namespace orvela {

namespace fs = std::filesystem;

namespace {

constexpr char kProgram[] = "orvela-windows";
constexpr char kReport[] = "https://kestrand.example/support";
// For each pixel: beside the photograph's samples those that both processes share; planes and previews took
// 17 bytes of every pixel of a photograph in Advanced, a final touch takes a plane more.
constexpr std::uint64_t kSampleCopies = 3;
constexpr std::uint64_t kWorkBytes = 24;

// Signals as a program finds them that was started by hand, whatever this one blocks or ignores.
class Attributes {
public:
    Attributes() {
        ::posix_spawnattr_init(&mAttributes);
        sigset_t signals;
        ::sigemptyset(&signals);
        ::posix_spawnattr_setsigmask(&mAttributes, &signals);
        for (const int each : {SIGXFSZ, SIGPIPE, SIGCHLD})
            ::sigaddset(&signals, each);
        ::posix_spawnattr_setsigdefault(&mAttributes, &signals);
        ::posix_spawnattr_setflags(&mAttributes, POSIX_SPAWN_SETSIGMASK | POSIX_SPAWN_SETSIGDEF);
    }
    ~Attributes() { ::posix_spawnattr_destroy(&mAttributes); }
    Attributes(const Attributes&) = delete;
    Attributes& operator=(const Attributes&) = delete;

    const posix_spawnattr_t* get() const { return &mAttributes; }

private:
    posix_spawnattr_t mAttributes{};
};

// The one file that is handed on.
class Files {
public:
    explicit Files(int handle) {
        ::posix_spawn_file_actions_init(&mActions);
        if (handle >= 0) // onto itself: it stays open there
            ::posix_spawn_file_actions_adddup2(&mActions, handle, handle);
    }
    ~Files() { ::posix_spawn_file_actions_destroy(&mActions); }
    Files(const Files&) = delete;
    Files& operator=(const Files&) = delete;

    const posix_spawn_file_actions_t* get() const { return &mActions; }

private:
    posix_spawn_file_actions_t mActions{};
};

pid_t start(std::vector<std::string> arguments, int handle) {
    std::string program = programFile(kProgram).string();
    std::string caller = std::to_string(::getpid());
    std::vector<char*> pointers{program.data(), caller.data()};
    for (std::string& argument : arguments)
        pointers.push_back(argument.data());
    pointers.push_back(nullptr);
    pid_t process = -1;
    const Attributes attributes;
    const Files files(handle);
    if (const int error =
            ::posix_spawn(&process, program.c_str(), files.get(), attributes.get(), pointers.data(), environ))
        throw FilterFailure(program + ": cannot be started: " + std::strerror(error));
    return process;
}

// The next windows write their log from the beginning.
std::string keptLog(const fs::path& log) {
    fs::path kept = log;
    kept.replace_filename("orvela-crash.log");
    std::error_code error;
    fs::rename(log, kept, error);
    return error ? log.string() : kept.string();
}

fs::path folderOfProgram() {
    std::error_code error;
    const fs::path program = fs::read_symlink("/proc/self/exe", error);
    if (error)
        throw FilterFailure("the folder of this program is not known: " + error.message());
    return program.parent_path();
}

} // namespace

fs::path programFile(const std::string& name) {
    const fs::path here = folderOfProgram();
    for (const fs::path& folder : {here, here / ORVELA_PROGRAM_FILES}) {
        std::error_code error;
        if (fs::exists(folder / name, error))
            return (folder / name).lexically_normal();
    }
    throw FilterFailure(name + " is not beside this program; install Orvela again");
}

WindowProcess::WindowProcess(const std::vector<std::string>& arguments, int handle)
    : mProcess(start(arguments, handle)) {}

WindowProcess::~WindowProcess() {
    kill();
    while (::waitpid(mProcess, nullptr, 0) < 0 && errno == EINTR) {
    }
}

// Not yet waited for, the number cannot have gone to another process.
void WindowProcess::kill() const {
    ::kill(mProcess, SIGKILL);
}

WindowProcess::End WindowProcess::wait() {
    siginfo_t end{};
    while (::waitid(P_PID, static_cast<id_t>(mProcess), &end, WEXITED | WNOWAIT) < 0)
        if (errno != EINTR)
            throw FilterFailure(std::string("the end of the windows is not known: ") + std::strerror(errno));
    return end.si_code == CLD_EXITED ? End{end.si_status, 0} : End{0, end.si_status};
}

ReadLimits FilterProcess::needs() {
    ReadLimits needs;
    needs.sampleCopies = kSampleCopies;
    needs.workBytes = kWorkBytes;
    return needs;
}

FilterProcess::FilterProcess(SharedPicture& picture)
    : mPicture(picture), mProcess({"picture", std::to_string(picture.handle())}, picture.handle()) {}

bool FilterProcess::wait() {
    return isAccepted(mProcess.wait());
}

// What the other process told counts, even when it came to grief later; its texts may have suffered.
bool FilterProcess::isAccepted(const WindowProcess::End& end) {
    SharedPicture::Head& head = mPicture.head();
    head.text.back() = head.logFile.back() = 0;
    switch (head.outcome) {
    case SharedPicture::Outcome::Failed:
        throw FilterFailure(head.text.data());
    case SharedPicture::Outcome::Ran:
        if (head.resultCode == host::NoErr || head.resultCode == host::UserCanceledErr)
            return head.resultCode == host::NoErr;
        throw FilterFailure("the filter failed with code " + std::to_string(head.resultCode) +
                            "; its log is " + head.logFile.data());
    default:
        throw FilterFailure("the windows ended " +
                            (end.signal != 0 ? std::string("by signal ") + ::strsignal(end.signal)
                                             : std::string("unexpectedly")) +
                            "; please report it to " + kReport + " with the log " +
                            keptLog(head.logFile.data()));
    }
}

} // namespace orvela
