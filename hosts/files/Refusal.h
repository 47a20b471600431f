#pragma once

#include <cstdint>
#include <filesystem>
#include <string>

namespace orvela {

/// What to do about a photograph whose file is damaged.
inline constexpr char kCopyAgain[] = "copy it again from the camera or a backup";

/// Refuses a photograph: "PATH: CAUSE; ADVICE". @throws PhotographError
[[noreturn]] void refuse(const std::filesystem::path& path, const std::string& cause,
                         const std::string& advice);

/// Refuses pictures without pixels and pictures whose edges the filter record cannot express.
/// @throws PhotographError
void checkEdges(std::int64_t width, std::int64_t height, const std::filesystem::path& path);

} // namespace orvela
