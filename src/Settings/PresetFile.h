#pragma once

#include "Settings/CSliderParams.h"
#include "Utility/ErrorText.h"

#include <QJsonObject>
#include <QStringList>

#include <stdexcept>
#include <string>

namespace orvela {

/// A file that is no preset, or cannot be read: the text names the file, the cause and what to do.
class PresetError : public std::runtime_error {
public:
    explicit PresetError(const ErrorText& text)
        : std::runtime_error(text.english().toStdString()), mText(text) {}
    /// In English only, for the command line.
    explicit PresetError(const std::string& text)
        : PresetError(ErrorText("", "%1", {QString::fromStdString(text)})) {}

    /// In the language of the user.
    QString shown() const { return mText.shown(); }

private:
    ErrorText mText;
};

/// Settings as the text of a JSON file, by field name:
///
///     { "version": 1, "settings": { "SaturationValue": 640, "SaturationEnabled": true } }
///
/// Values are positions (0 to 1000) or picker colours (0 to 255), switches are true or false. Whatever else
/// the text holds is kept as it is and comes back in text().
class PresetFile {
public:
    /// An empty preset.
    PresetFile();

    /// @param path  of the file that holds the text, for messages
    /// @throws PresetError for a text that is no preset, has a newer version or holds a value of the wrong
    ///         type or out of range
    static PresetFile parse(const QByteArray& text, const QString& path);

    /// Sets the fields that the text names; the others stay.
    void applyTo(CSliderParams& sliders) const;

    /// Takes every field of `sliders`.
    void take(const CSliderParams& sliders);

    /// What the file is to hold.
    QByteArray text() const;

    /// Names in the text that this version does not know.
    QStringList unknownNames() const;

private:
    QJsonObject mRoot;
};

} // namespace orvela
