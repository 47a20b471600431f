#include "PluginEntry/Module/ModuleApplication.h"

#include "GUI/Windows/Translations.h"
#include "Platform/ModuleFile.h"
#include "Platform/WindowSystem.h"
#include "PluginEntry/Module/OrvelaQApplication.h"

#include <QPixmapCache>
#include <QThread>

#include <clocale>
#include <cstdlib>
#include <memory>
#include <string>

namespace orvela {

namespace {

int gArgumentCount = 0; // kept by the application object

// What the application object changes of the process while it is made, for a host that has not asked for it.
class HostSurroundings {
public:
    explicit HostSurroundings(const std::string& windowSystem)
        : mLocale(std::setlocale(LC_ALL, nullptr)), mPlatform(qgetenv(kPlatform)) {
        qputenv(kPlatform, QByteArray::fromStdString(windowSystem));
    }
    ~HostSurroundings() {
        std::setlocale(LC_ALL, mLocale.c_str());
        if (mPlatform.isNull())
            qunsetenv(kPlatform);
        else
            qputenv(kPlatform, mPlatform);
    }
    HostSurroundings(const HostSurroundings&) = delete;
    HostSurroundings& operator=(const HostSurroundings&) = delete;

private:
    static constexpr char kPlatform[] = "QT_QPA_PLATFORM";
    std::string mLocale;
    QByteArray mPlatform;
};

std::unique_ptr<OrvelaQApplication> makeApplication() try {
    if (QCoreApplication::instance()) {
        pinModule(); // the host's toolkit stays, and with it what it knows of this module
        return nullptr;
    }
    const WindowSystem windowSystem = reachWindowSystem();
    if (windowSystem.name.empty())
        return nullptr;
    const HostSurroundings surroundings(windowSystem.name);
    return std::make_unique<OrvelaQApplication>(gArgumentCount, nullptr);
} catch (const std::exception&) { // while the module is loaded, where nobody could catch it
    return nullptr;
}

std::unique_ptr<OrvelaQApplication> gApplication = makeApplication();

} // namespace

bool ModuleApplication::canShowWindows() {
    const auto* application = qobject_cast<QApplication*>(QCoreApplication::instance());
    return application && application->thread() == QThread::currentThread();
}

ModuleApplication::Use::Use() {
    if (sUses++ == 0 && canShowWindows())
        Translations::install(QLocale::system(),
                              gApplication ? Translations::WithToolkit : Translations::WindowsOnly);
}

ModuleApplication::Use::~Use() {
    if (--sUses > 0)
        return;
    Translations::remove();
    if (!gApplication)
        return;
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QPixmapCache::clear();
    std::atexit([] { gApplication.reset(); }); // of a module also when it is unloaded
}

} // namespace orvela
