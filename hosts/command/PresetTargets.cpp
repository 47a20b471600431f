#include "command/PresetTargets.h"

#include <QFileInfo>

namespace orvela {

PresetFile presetToWriteInto(const QString& path, bool overwrite) {
    const QFileInfo file(path);
    if (!file.exists())
        return {};
    if (!overwrite)
        throw PresetError(path.toStdString() + ": exists already; use --force to overwrite it");
    return PresetFile::read(path);
}

} // namespace orvela
