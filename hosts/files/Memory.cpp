#include "files/Memory.h"

#include <pthread.h>
#include <sys/resource.h>

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <fstream>
#include <optional>
#include <sstream>

namespace orvela {

namespace {

// The number after `key` in a file of lines "KEY NUMBER ..."; with an empty key the first number of the file.
std::optional<std::uint64_t> numberIn(const std::string& file, const std::string& key = {}) {
    std::ifstream stream(file);
    for (std::string line; std::getline(stream, line);) {
        std::istringstream words(line);
        std::string first;
        std::uint64_t number = 0;
        if (!key.empty() && (!(words >> first) || first != key))
            continue;
        return words >> number ? std::optional(number) : std::nullopt;
    }
    return std::nullopt;
}

std::uint64_t difference(std::uint64_t limit, std::uint64_t used) {
    return limit > used ? limit - used : 0;
}

std::uint64_t kibibytes(const std::string& file, const std::string& key) {
    return 1024 * numberIn(file, key).value_or(0);
}

std::uint64_t leftBy(int resource, std::uint64_t used) {
    rlimit limit{};
    if (::getrlimit(resource, &limit) != 0 || limit.rlim_cur == RLIM_INFINITY)
        return kUnlimited;
    return difference(limit.rlim_cur, used);
}

// Pages of files can be dropped, so that they do not count as taken.
std::uint64_t leftIn(const std::string& group, const char* limitFile, const char* usageFile,
                     const std::string& prefix) {
    const auto limit = numberIn(group + limitFile); // "max" is no number
    const auto usage = numberIn(group + usageFile);
    if (!limit || !usage)
        return kUnlimited;
    const std::string statistics = group + "/memory.stat";
    const std::uint64_t pages = numberIn(statistics, prefix + "inactive_file").value_or(0) +
                                numberIn(statistics, prefix + "active_file").value_or(0);
    return difference(*limit, difference(*usage, pages));
}

// The least that the group at `path` and those around it leave. Inside a container the folders of the outer
// groups are missing, and its own one stands at the top.
std::uint64_t leftByGroups(const std::string& top, std::string path, bool isFirstVersion) {
    std::uint64_t left = kUnlimited;
    for (;; path.resize(path.find_last_of('/'))) {
        const std::string group = top + path;
        left = std::min(
            left, isFirstVersion ? leftIn(group, "/memory.limit_in_bytes", "/memory.usage_in_bytes", "total_")
                                 : leftIn(group, "/memory.max", "/memory.current", ""));
        if (path.find('/') == std::string::npos)
            return left;
    }
}

// Lines "NUMBER:CONTROLLERS:PATH"; the second version has no controllers there.
std::uint64_t leftByControl(const std::string& root) {
    std::uint64_t left = kUnlimited;
    const std::string top = root + "/sys/fs/cgroup";
    std::ifstream stream(root + "/proc/self/cgroup");
    std::string number;
    std::string controllers;
    std::string path;
    while (std::getline(stream, number, ':') && std::getline(stream, controllers, ':') &&
           std::getline(stream, path)) {
        if (controllers.empty())
            left = std::min(left, leftByGroups(top, path, false));
        if (("," + controllers + ",").find(",memory,") != std::string::npos)
            left = std::min(left, leftByGroups(top + "/memory", path, true));
    }
    return left;
}

std::uint64_t leftByMachine(const std::string& root) {
    const std::string file = root + "/proc/meminfo";
    const auto available = numberIn(file, "MemAvailable:");
    return available ? 1024 * *available + kibibytes(file, "SwapFree:") : kUnlimited;
}

} // namespace

std::uint64_t grantedMemory(const std::string& root) {
    return std::min(leftByControl(root), leftByMachine(root));
}

std::uint64_t grantedAddresses() {
    const std::string status = "/proc/self/status";
    return std::min(leftBy(RLIMIT_AS, kibibytes(status, "VmSize:")),
                    leftBy(RLIMIT_DATA, kibibytes(status, "VmData:")));
}

std::uint64_t obtainableMemory() {
    return std::min(grantedMemory(), grantedAddresses());
}

std::uint64_t mappedByThreads(int threads) {
    constexpr int kTheirThreads = 3;
    pthread_attr_t attributes;
    std::size_t stack = 8 << 20;
    if (::pthread_attr_init(&attributes) == 0) {
        ::pthread_attr_getstacksize(&attributes, &stack);
        ::pthread_attr_destroy(&attributes);
    }
    return stack * static_cast<std::uint64_t>(threads - 1 + kTheirThreads);
}

std::string amountOf(std::uint64_t bytes) {
    const double megabytes = static_cast<double>(bytes) / 1e6;
    char text[40];
    if (megabytes < 1000)
        std::snprintf(text, sizeof text, "%.0f MB", std::ceil(megabytes));
    else
        std::snprintf(text, sizeof text, "%.1f GB", megabytes / 1000);
    return text;
}

} // namespace orvela
