#include "PluginEntry/Module/EntrySetup.h"

#include "GUI/Windows/MessageBoxes.h"
#include "Platform/ModuleFile.h"
#include "PluginEntry/Module/ModuleCall.h"
#include "Settings/SettingsStore.h"
#include "Utility/CGenericEx.h"
#include "Utility/Logger.h"

#include <QCoreApplication>
#include <QFile>

#include <cstdlib>

namespace orvela {

namespace {

constexpr char kOrganization[] = "Kestrand";

void logMessage(QtMsgType type, const QMessageLogContext&, const QString& text) {
    const LogLevel level = type == QtWarningMsg                          ? LogLevel::Warning
                           : type == QtCriticalMsg || type == QtFatalMsg ? LogLevel::Error
                                                                         : LogLevel::Debug;
    Log::log(level, "Qt: %s", text.toUtf8().constData());
    if (type == QtFatalMsg)
        std::abort();
}

// Also of a name that is no text.
QString textOf(const std::filesystem::path& path) {
#ifdef Q_OS_WIN
    return QString::fromStdWString(path.native());
#else
    return QFile::decodeName(path.c_str());
#endif
}

void nameModule() {
    const std::filesystem::path file = moduleFile();
    if (file.empty())
        throw CGenericEx(QStringLiteral("DLL Name mitmatch."), "PluginMain", __LINE__);
    ModuleCall& call = ModuleCall::current();
    call.pluginPath = textOf(file);
    call.pluginName = textOf(file.filename()).section(QLatin1Char('.'), 0, 0);
}

// Kept from the first call to the module's unloading, wherever later calls would have it.
void openLog() {
    struct Kept {
        Kept() { Log::install(std::make_unique<CLoggerFile>(textOf(logFile()).toLocal8Bit())); }
        ~Kept() { Log::install(nullptr); }
    };
    static const Kept log;
}

} // namespace

EntrySetup::EntrySetup()
    : mOrganization(QCoreApplication::organizationName()), mDomain(QCoreApplication::organizationDomain()),
      mApplication(QCoreApplication::applicationName()) {
    nameModule();
    openLog();
    Log::setThreshold(LogLevel::Debug);
    Log::setPrefixes(false);
    mHandler = qInstallMessageHandler(logMessage);
    QCoreApplication::setOrganizationName(QLatin1String(kOrganization));
    QCoreApplication::setOrganizationDomain(QStringLiteral(ORVELA_DOMAIN));
    QCoreApplication::setApplicationName(ModuleCall::current().pluginName);
    setSettingsApplication(ModuleCall::current().pluginName);
    installMessageBoxes();
}

EntrySetup::~EntrySetup() {
    qInstallMessageHandler(mHandler);
    QCoreApplication::setOrganizationName(mOrganization);
    QCoreApplication::setOrganizationDomain(mDomain);
    QCoreApplication::setApplicationName(mApplication);
}

} // namespace orvela
