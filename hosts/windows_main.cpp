// orvela-windows: the filter's windows over a picture that the calling program shares, in this process of
// their own. Started by `orvela edit` and the like, not by hand; PROCESS is the caller's.
//     orvela-windows PROCESS picture HANDLE   the shared picture's file descriptor
//     orvela-windows PROCESS about            what the filter tells about itself
//     orvela-windows PROCESS tell TEXT        a message
//     orvela-windows PROCESS warn TEXT        a message of something that failed

#include "Platform/ModuleFile.h"
#include "Platform/WindowSystem.h"
#include "common/FilterModule.h"
#include "common/FilterProcess.h"

#include <QApplication>
#include <QMessageBox>

#include <sys/prctl.h>
#include <unistd.h>

#include <bit>
#include <csignal>
#include <cstdlib>
#include <iostream>
#include <string_view>

namespace {

using namespace orvela;

constexpr char kModule[] = "Orvela.8bf";
constexpr int kLines = 12; // of a message before what has to be asked for

// Nobody is left to take the result when the calling program ends.
void endWith(pid_t caller) {
    ::prctl(PR_SET_PDEATHSIG, SIGKILL);
    if (::getppid() != caller)
        std::exit(1);
}

WindowSystem requireWindows() {
    WindowSystem reached = reachWindowSystem();
    if (reached.name.empty())
        throw FilterFailure("there is no display for windows; set DISPLAY or WAYLAND_DISPLAY, or use "
                            "`orvela enhance`, which needs none");
    return reached;
}

void run(SharedPicture& picture) {
    SharedPicture::Head& head = picture.head();
    try {
        setText(head.logFile, logFile().string());
        const WindowSystem windows = requireWindows();
        FilterModule module(programFile(kModule));
        ImageHost host(head.shape, picture.source(), picture.result());
        host.setWindow(std::bit_cast<void*>(head.hostWindow));
        head.resultCode = module.run(host);
        head.outcome = SharedPicture::Outcome::Ran;
    } catch (const std::exception& failure) {
        setText(head.text, failure.what());
        head.outcome = SharedPicture::Outcome::Failed;
    }
}

int about() {
    const WindowSystem windows = requireWindows();
    return FilterModule(programFile(kModule)).about() == host::NoErr ? 0 : 1;
}

int show(QMessageBox::Icon icon, const QString& text) {
    const WindowSystem windows = requireWindows();
    int argumentCount = 0;
    const QApplication application(argumentCount, nullptr);
    QMessageBox box(icon, QStringLiteral("Orvela"), text.section(QLatin1Char('\n'), 0, kLines - 1).trimmed());
    if (const QString rest = text.section(QLatin1Char('\n'), kLines).trimmed(); !rest.isEmpty())
        box.setDetailedText(rest);
    box.setTextFormat(Qt::PlainText);
    box.exec();
    return 0;
}

int share(int handle) {
    SharedPicture picture(handle);
    run(picture);
    return 0;
}

int act(std::string_view what, const char* argument) {
    if (what == "about")
        return about();
    if (what == "picture")
        return share(std::atoi(argument));
    return show(what == "tell" ? QMessageBox::Information : QMessageBox::Warning,
                QString::fromUtf8(argument));
}

} // namespace

int main(int argc, char** argv) {
    if (argc < 3 || (argc < 4 && std::string_view(argv[2]) != "about")) {
        std::cerr << "orvela-windows: shows the filter's windows for `orvela edit`; start that\n";
        return 2;
    }
    try {
        endWith(std::atoi(argv[1]));
        return act(argv[2], argv[3]);
    } catch (const std::exception& failure) {
        std::cerr << "orvela-windows: " << failure.what() << '\n';
        return 1;
    }
}
