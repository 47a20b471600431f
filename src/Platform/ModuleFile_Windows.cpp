#include "Platform/ModuleFile.h"

#include <windows.h>

#include <array>
#include <cstdlib>

namespace orvela {

namespace fs = std::filesystem;

namespace {

const char kPlace = 0; // an address of the module

} // namespace

fs::path moduleFile() {
    MEMORY_BASIC_INFORMATION memory{};
    if (VirtualQuery(&kPlace, &memory, sizeof memory) == 0)
        return {};
    std::array<wchar_t, MAX_PATH> name{};
    const DWORD length =
        GetModuleFileNameW(static_cast<HMODULE>(memory.AllocationBase), name.data(), MAX_PATH);
    return length > 0 && length < MAX_PATH ? fs::path(name.data(), name.data() + length) : fs::path();
}

fs::path logFile() {
    if (const wchar_t* file = _wgetenv(L"ORVELA_TMP_FILE"))
        return file;
    const wchar_t* folder = _wgetenv(L"TMP");
    return folder ? fs::path(folder) / L"orvela.log" : fs::path();
}

void pinModule() {
    HMODULE module = nullptr;
    GetModuleHandleExA(GET_MODULE_HANDLE_EX_FLAG_PIN | GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS, &kPlace,
                       &module);
}

} // namespace orvela
