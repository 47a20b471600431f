#pragma once

#include "common/SharedPicture.h"
#include "files/DeclaredPicture.h"

#include <sys/types.h>

#include <filesystem>
#include <stdexcept>
#include <string>
#include <vector>

namespace orvela {

/// The filter's windows could not be shown, or their process ended before its time: the text tells why and
/// what to do. The photograph is as it was.
class FilterFailure : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

/// The program of the filter's windows in a process of its own, which ends when this one does.
class WindowProcess {
public:
    /// @param arguments  what it is to show
    /// @param handle     file descriptor that it gets; -1: none
    /// @throws FilterFailure when it cannot be started
    explicit WindowProcess(const std::vector<std::string>& arguments, int handle = -1);

    /// Ends the process if it is still running.
    ~WindowProcess();
    WindowProcess(const WindowProcess&) = delete;
    WindowProcess& operator=(const WindowProcess&) = delete;

    /// How the process ended.
    struct End {
        int status = 0; ///< of exit
        int signal = 0; ///< that ended it; 0: none
    };

    /// Waits for the end. @throws FilterFailure when there is none to wait for
    End wait();

    /// Ends the process at once; may be called from another thread during wait().
    void kill() const;

private:
    pid_t mProcess;
};

/// The filter's windows over a picture: what goes wrong in their process does not reach the photograph.
class FilterProcess {
public:
    /// What both processes together take of memory, the photograph included.
    static ReadLimits needs();

    /// Opens the windows.
    /// @param picture  outlives this object
    /// @throws FilterFailure
    explicit FilterProcess(SharedPicture& picture);

    /// Waits until the user has closed the windows.
    /// @return true when the picture's result is accepted, false when the user cancelled
    /// @throws FilterFailure
    bool wait();

    /// Ends the process at once; may be called from another thread during wait(), which fails then.
    void kill() const { mProcess.kill(); }

private:
    bool isAccepted(const WindowProcess::End& end);

    SharedPicture& mPicture;
    WindowProcess mProcess;
};

/// Where a file of the program lies: beside the running program, or where the installation puts such files.
/// @throws FilterFailure when it lies nowhere
std::filesystem::path programFile(const std::string& name);

} // namespace orvela
