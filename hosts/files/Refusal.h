#pragma once

#include <filesystem>
#include <string>

namespace orvela {

/// What to do about a photograph whose file is damaged.
inline constexpr char kCopyAgain[] = "copy it again from the camera or a backup";

/// Refuses a photograph: "PATH: CAUSE; ADVICE". @throws PhotographError
[[noreturn]] void refuse(const std::filesystem::path& path, const std::string& cause,
                         const std::string& advice);

/// Refuses a photograph that a library could not read: as damaged, or for want of memory where that is what
/// the library says.
/// @param text  of the library
/// @throws PhotographError, MemoryError
[[noreturn]] void refuseUnread(const std::filesystem::path& path, const std::string& text);

} // namespace orvela
