#pragma once

#include <cstdint>
#include <filesystem>
#include <functional>
#include <optional>
#include <set>
#include <utility>
#include <vector>

namespace orvela {

/// Where the results go.
struct TargetOptions {
    std::optional<std::filesystem::path> file;   ///< of the one result
    std::optional<std::filesystem::path> folder; ///< of all results, under the names of their sources
    bool freeNames = false; ///< a name that is taken gets a number behind it: NAME-enhanced-2.EXT
};

/// One photograph and the file that its result goes to.
struct Job {
    std::filesystem::path source;
    std::filesystem::path target;
};

/// The target of every source: the file or folder told, or NAME-enhanced.EXT beside the source. Formats that
/// are read only give TIFF.
/// @throws UsageError when two sources share a target, a target is one of the sources, or nothing can be
///         written under its name
std::vector<Job> planTargets(const std::vector<std::filesystem::path>& sources, const TargetOptions& options);

/// True for a file that a run without a target of its own wrote, also one with a number.
bool isEarlierResult(const std::filesystem::path& file);

/// The file, or, when there is such a file already or the name is taken otherwise, the first free one with a
/// number behind it.
std::filesystem::path freeName(const std::filesystem::path& file,
                               const std::function<bool(const std::filesystem::path&)>& isTaken = {});

/// The absolute path without links, "." and ".."; with the links where they lead nowhere.
std::filesystem::path realPath(const std::filesystem::path& path);

/// Files, known by what they are on the disk and by where they are or would be.
class FileSet {
public:
    void add(const std::filesystem::path& file);

    /// True when it is one of them under any name, also through links.
    bool contains(const std::filesystem::path& file) const;

private:
    std::set<std::filesystem::path> mPaths;
    std::set<std::pair<std::uintmax_t, std::uintmax_t>> mIdentities; ///< device and number on it
};

} // namespace orvela
