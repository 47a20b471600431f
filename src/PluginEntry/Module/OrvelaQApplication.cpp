#include "PluginEntry/Module/OrvelaQApplication.h"

#include "Utility/Logger.h"

bool OrvelaQApplication::notify(QObject* receiver, QEvent* event) {
    try {
        return QApplication::notify(receiver, event);
    } catch (...) {
        orvela::Log::log(orvela::LogLevel::Debug, "Caught C++ Exception");
        return false;
    }
}
