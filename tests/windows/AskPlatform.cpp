// Asks the sources that know Windows, and prints what they answer, in UTF-8.
//   ask_platform post HOST PORT PATH BODY AGENT LIMIT    milliseconds, error, then the reply up to the end
//   ask_platform keys | help TOPIC | log FOLDER | windows
#include "Platform/HelpViewer.h"
#include "Platform/Keyboard.h"
#include "Platform/ModuleFile.h"
#include "Platform/WebPost.h"
#include "Platform/WindowSystem.h"

#include <fcntl.h>
#include <io.h>
#include <windows.h>

#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <string>
#include <vector>

using namespace orvela;

namespace {

int post(const std::vector<std::string>& words) {
    const WebPost::Form form{words[1], static_cast<std::uint16_t>(std::stoi(words[2])), words[3], words[4],
                             words[5], std::chrono::milliseconds(std::stoi(words[6]))};
    const auto start = std::chrono::steady_clock::now();
    const auto [body, error] = WebPost::post(form);
    const auto spent = std::chrono::steady_clock::now() - start;
    std::printf("%d\n%s\n", static_cast<int>(spent / std::chrono::milliseconds(1)), error.c_str());
    std::fwrite(body.data(), 1, body.size(), stdout);
    return 0;
}

int keys() {
    std::printf("%d", Keyboard::shiftState());
    keybd_event(VK_SHIFT, 0, 0, 0);
    std::printf(" %d", Keyboard::shiftState());
    Keyboard::setShiftState([] { return 7; });
    std::printf(" %d", Keyboard::shiftState());
    Keyboard::setShiftState(nullptr);
    keybd_event(VK_SHIFT, 0, KEYEVENTF_KEYUP, 0);
    std::printf(" %d", Keyboard::shiftState());
    return 0;
}

// Twice, since the viewer is loaded once.
int help(const std::string& topic) {
    for (int time = 0; time < 2; ++time)
        std::printf("%d ", HelpViewer::show(nullptr, topic));
    return 0;
}

int log(const wchar_t* folder) {
    _wputenv_s(L"TMP", folder);
    const std::u8string file = logFile().u8string();
    std::fwrite(file.data(), 1, file.size(), stdout);
    return 0;
}

} // namespace

int wmain(int count, wchar_t** arguments) {
    _setmode(_fileno(stdout), _O_BINARY);
    std::vector<std::string> words;
    for (int i = 1; i < count; ++i)
        words.emplace_back(arguments[i], arguments[i] + wcslen(arguments[i])); // of ASCII where they are used
    const std::string what = words.empty() ? "" : words[0];
    if (what == "post" && words.size() == 7)
        return post(words);
    if (what == "keys")
        return keys();
    if (what == "help" && words.size() == 2)
        return help(words[1]);
    if (what == "log" && words.size() == 2)
        return log(arguments[2]);
    if (what == "windows")
        return std::puts(reachWindowSystem().name.c_str()) < 0;
    return 2;
}
