#include "PluginEntry/Module/FailureBox.h"

#include "Platform/FilterRecord.h"
#include "PluginEntry/Module/ModuleApplication.h"
#include "Utility/CGenericEx.h"
#include "Utility/Logger.h"

#include <QCoreApplication>
#include <QMessageBox>

namespace orvela {

namespace {

QString translated(const char* text) {
    return QCoreApplication::translate("PluginMain", text);
}

// Above the host's windows, whose window is not known to every box.
void show(QMessageBox::Icon icon, const QString& title, const QString& text) {
    if (!ModuleApplication::canShowWindows()) {
        Log::log(LogLevel::Error, "No window can be opened for: %s", text.toUtf8().constData());
        return;
    }
    QMessageBox box(icon, title, text, QMessageBox::Ok, nullptr,
                    Qt::Dialog | Qt::MSWindowsFixedSizeDialogHint | Qt::WindowStaysOnTopHint);
    box.setTextFormat(Qt::PlainText);
    box.exec();
}

void showGeneric(const CGenericEx& failure) {
    const QString title = QStringLiteral("Kestrand Orvela");
    const QString oldest = ExceptionStack::oldestMessage();
    if (oldest.startsWith(QLatin1String("[w]")) || oldest.startsWith(QLatin1String("[e]")))
        return show(QMessageBox::Warning, title, oldest.mid(3));
    show(QMessageBox::Critical, title,
         translated(
             QT_TRANSLATE_NOOP("PluginMain",
                               "%1\n(%2)\n\nIf the problem persists, review the plug-in's log, and contact\n"
                               "the Kestrand support team."))
             .arg(translated(failure.what()), oldest));
}

void showUnknown() {
    show(QMessageBox::Information,
         translated(QT_TRANSLATE_NOOP("PluginMain", "Error while running Kestrand Orvela")),
         translated(QT_TRANSLATE_NOOP("PluginMain",
                                      "The plug-in failed to run for an unknown reason.\nIf the problem "
                                      "persists, review the plug-in's log, and contact\nthe Kestrand support "
                                      "team.")));
}

void showCurrent(std::int16_t* result) {
    try {
        throw;
    } catch (const CGenericEx& failure) {
        showGeneric(failure);
    } catch (...) {
        *result = host::UserCanceledErr;
        showUnknown();
    }
}

} // namespace

void showFailure(std::int16_t* result) noexcept {
    try {
        showCurrent(result);
        ExceptionStack::writeToLog(true);
    } catch (...) { // no memory for a box: the code alone tells the host
        *result = host::UserCanceledErr;
    }
}

} // namespace orvela
