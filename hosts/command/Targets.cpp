#include "command/Targets.h"

#include "command/ExitStatus.h"
#include "files/FileFormat.h"
#include "files/PhotographWriter.h"
#include "run/UsageError.h"

#include <sys/stat.h>

#include <array>
#include <fstream>
#include <map>

namespace orvela {

namespace fs = std::filesystem;

namespace {

constexpr std::string_view kSuffix = "-enhanced";
constexpr int kMostNumbers = 10000;

// What the file is, whatever its name says; the name decides about files that cannot be read or are nothing
// known, which fail later on.
FileFormat formatOf(const fs::path& source) {
    std::array<std::uint8_t, 16> start = {};
    std::error_code error;
    if (fs::is_regular_file(source, error))
        std::ifstream(source, std::ios::binary).read(reinterpret_cast<char*>(start.data()), start.size());
    if (const std::optional<FileFormat> format = formatOfContent(start))
        return *format;
    return formatOfExtension(source).value_or(FileFormat::Png);
}

fs::path targetOf(const fs::path& source, const TargetOptions& options) {
    if (options.file)
        return *options.file;
    fs::path beside = defaultTarget(source, formatOf(source));
    if (!options.folder)
        return beside;
    fs::path name = source.stem();
    return *options.folder / (name += beside.extension());
}

// The target, or, where names that are taken get a number, one that neither a file nor another result has.
fs::path freeTarget(const fs::path& target, const TargetOptions& options,
                    const std::map<fs::path, fs::path>& planned) {
    if (!options.freeNames || options.file)
        return target;
    return freeName(target, [&planned](const fs::path& name) { return planned.contains(realPath(name)); });
}

// What no photograph could be written into.
void checkTargetName(const fs::path& target) {
    std::error_code none;
    if (fs::is_directory(target, none))
        throw UsageError(target.string() + ": is a folder; use -d FOLDER, or name a file in it");
    try {
        static_cast<void>(writtenFormat(target));
    } catch (const PhotographError& error) {
        throw UsageError(error.what());
    }
}

// Device and number of an existing file.
std::optional<std::pair<std::uintmax_t, std::uintmax_t>> identityOf(const fs::path& file) {
    struct stat status {};
    if (::stat(file.c_str(), &status) != 0)
        return std::nullopt;
    return std::pair{std::uintmax_t{status.st_dev}, std::uintmax_t{status.st_ino}};
}

} // namespace

std::vector<Job> planTargets(const std::vector<fs::path>& sources, const TargetOptions& options) {
    if (options.file && options.folder)
        throw UsageError("-o and -d exclude each other");
    if (options.file && sources.size() > 1)
        throw UsageError("-o takes the result of one photograph, " + std::to_string(sources.size()) +
                         " were given; use -d FOLDER");
    if (options.file)
        checkTargetName(*options.file);
    FileSet known;
    for (const fs::path& source : sources)
        known.add(source);
    std::vector<Job> jobs;
    std::map<fs::path, fs::path> sourceOfTarget;
    for (const fs::path& source : sources) {
        const fs::path target = freeTarget(targetOf(source, options), options, sourceOfTarget);
        const Job& job = jobs.emplace_back(Job{source, target});
        if (known.contains(job.target))
            throw UsageError(job.target.string() +
                             ": the result would overwrite a photograph that is read; name another target");
        const auto [other, isNew] = sourceOfTarget.emplace(realPath(job.target), source);
        if (!isNew)
            throw UsageError(other->second.string() + " and " + source.string() + " would both become " +
                             job.target.string() + "; enhance them apart");
    }
    return jobs;
}

bool isEarlierResult(const fs::path& file) {
    std::string name = file.stem().string();
    const auto digits = name.find_last_not_of("0123456789");
    if (digits != std::string::npos && digits + 1 < name.size() && name[digits] == '-')
        name.resize(digits);
    return name.ends_with(kSuffix);
}

fs::path freeName(const fs::path& file, const std::function<bool(const fs::path&)>& isTaken) {
    const auto exists = [](const fs::path& name) {
        std::error_code error;
        return fs::symlink_status(name, error).type() != fs::file_type::not_found;
    };
    fs::path candidate = file;
    for (int number = 2; (exists(candidate) || (isTaken && isTaken(candidate))) && number < kMostNumbers;
         ++number) {
        fs::path name = file.stem();
        name += '-';
        name += std::to_string(number);
        candidate = file.parent_path() / (name += file.extension());
    }
    return candidate;
}

fs::path realPath(const fs::path& path) {
    std::error_code error;
    const fs::path absolute = fs::absolute(path, error);
    const fs::path real = fs::weakly_canonical(absolute, error);
    return error ? absolute.lexically_normal() : real;
}

void FileSet::add(const fs::path& file) {
    mPaths.insert(realPath(file));
    if (const auto identity = identityOf(file))
        mIdentities.insert(*identity);
}

bool FileSet::contains(const fs::path& file) const {
    const auto identity = identityOf(file);
    return (identity && mIdentities.contains(*identity)) || mPaths.contains(realPath(file));
}

} // namespace orvela
