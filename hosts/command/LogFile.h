#pragma once

#include "files/TargetFile.h"

#include <exception>

namespace orvela {

/// The engine's log on its way to a file: every line is handed to the system at once, the file appears when
/// the log is finished. To a stream the lines go directly. A line that cannot be written stops nothing but
/// the log.
class LogFile {
public:
    /// Makes it the log of the process, everything down to the debug level.
    /// @param stop  when set, a stream, which nobody may read, gets no more lines; a file still does
    /// @throws TargetError when the file cannot be written or must not be overwritten
    LogFile(const std::filesystem::path& path, bool overwrite, const std::atomic<bool>& stop);
    ~LogFile();
    LogFile(const LogFile&) = delete;
    LogFile& operator=(const LogFile&) = delete;

    /// Ends logging and gives the file its name.
    /// @throws TargetError when a line could not be written or the file not be finished
    void finish();

private:
    class Lines;

    TargetFile mFile;
    bool mOverwrite;
    const std::atomic<bool>* mStop; ///< for a stream
    std::exception_ptr mFailure;    ///< of the first line that could not be written
};

} // namespace orvela
