#include "Platform/ModuleFile.h"

#include <dlfcn.h>

#include <cstdlib>

namespace orvela {

namespace fs = std::filesystem;

namespace {

constexpr char kLog[] = "orvela.log";

const char* variable(const char* name) {
    const char* value = std::getenv(name);
    return value && *value ? value : nullptr;
}

} // namespace

fs::path moduleFile() {
    static const char place = 0;
    Dl_info info{};
    if (::dladdr(&place, &info) == 0 || info.dli_fname == nullptr)
        return {};
    std::error_code error;
    fs::path file = fs::absolute(info.dli_fname, error);
    return error ? fs::path() : file;
}

// A place that others can write to would let them choose which file the log destroys.
fs::path logFile() {
    if (const char* file = variable("ORVELA_TMP_FILE"))
        return file;
    if (const char* folder = variable("TMP"))
        return fs::path(folder) / kLog;
    const char* cache = variable("XDG_CACHE_HOME");
    const char* home = variable("HOME");
    if (!cache && !home)
        return {};
    const fs::path folder = (cache ? fs::path(cache) : fs::path(home) / ".cache") / "Kestrand";
    std::error_code error; // then the log cannot be opened
    fs::create_directories(folder, error);
    return folder / kLog;
}

void pinModule() {
    ::dlopen(moduleFile().c_str(), RTLD_NOW | RTLD_NOLOAD | RTLD_NODELETE);
}

} // namespace orvela
