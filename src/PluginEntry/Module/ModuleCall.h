#pragma once

#include "Platform/FilterRecord.h"

#include <QString>

namespace orvela {

/// What the whole module knows of the call that it serves.
struct ModuleCall {
    host::FilterRecord* record = nullptr;                     ///< of the latest call
    std::int16_t* result = nullptr;                           ///< of the latest call
    QString pluginPath = QStringLiteral("uninit_pluginpath"); ///< full name of the module's file
    QString pluginName = QStringLiteral("uninit_pluginname"); ///< its last part up to the first dot

    static ModuleCall& current();
};

} // namespace orvela
