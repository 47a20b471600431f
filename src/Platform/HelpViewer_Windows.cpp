#include "Platform/HelpViewer.h"

#include <windows.h>

#include <array>

namespace orvela {

namespace {

using ViewerCall = HWND(WINAPI*)(HWND owner, LPCSTR topic, UINT command, DWORD_PTR data);

constexpr char kViewerKey[] = "CLSID\\{ADB880A6-D8FF-11CF-9377-00AA003B7A11}\\InprocServer32";
constexpr char kViewerFile[] = "hhctrl.ocx";
constexpr WORD kViewerOrdinal = 14;
constexpr UINT kDisplayTopic = 0;

HMODULE registeredViewer() {
    std::array<char, 260> path = {};
    DWORD size = path.size();
    const LSTATUS read =
        RegGetValueA(HKEY_CLASSES_ROOT, kViewerKey, nullptr, RRF_RT_REG_SZ, nullptr, path.data(), &size);
    return read == ERROR_SUCCESS ? LoadLibraryA(path.data()) : nullptr;
}

ViewerCall loadViewer() {
    HMODULE module = registeredViewer();
    if (!module)
        module = LoadLibraryA(kViewerFile);
    if (!module)
        return nullptr;
    auto* const function = reinterpret_cast<void*>(GetProcAddress(module, MAKEINTRESOURCEA(kViewerOrdinal)));
    return reinterpret_cast<ViewerCall>(function);
}

} // namespace

bool HelpViewer::show(void* owner, const std::string& topic) {
    // Loaded once and for the life of the process; what failed once is not tried again.
    static const ViewerCall viewer = loadViewer();
    if (!viewer)
        return false;
    viewer(static_cast<HWND>(owner), topic.c_str(), kDisplayTopic, 0);
    return true;
}

} // namespace orvela
