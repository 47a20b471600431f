#pragma once

#include "Settings/CSliderParams.h"

#include <QJsonObject>
#include <QStringList>

#include <stdexcept>

namespace orvela {

/// A preset file that cannot be read or written: the text names the file, the cause and what to do.
class PresetError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

/// Settings as a JSON file, by field name:
///
///     { "version": 1, "settings": { "SaturationValue": 640, "SaturationEnabled": true } }
///
/// Values are positions (0 to 1000) or picker colours (0 to 255), switches are true or false. Whatever else
/// the file holds is kept as it is and written back.
class PresetFile {
public:
    /// An empty preset.
    PresetFile();

    /// @throws PresetError for a file that cannot be read, is no preset, has a newer version or holds a value
    ///         of the wrong type or out of range
    static PresetFile read(const QString& path);

    /// Sets the fields that the file names; the others stay.
    void applyTo(CSliderParams& sliders) const;

    /// Takes every field of `sliders`.
    void take(const CSliderParams& sliders);

    /// Writes the whole file or, when that fails, leaves an older one as it was.
    /// @throws PresetError
    void write(const QString& path) const;

    /// Names in the file that this version does not know.
    QStringList unknownNames() const;

private:
    QJsonObject mRoot;
};

} // namespace orvela
