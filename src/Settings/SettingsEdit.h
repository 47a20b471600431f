#pragma once

#include "Utility/CGenericEx.h"
#include "Utility/ErrorText.h"

#include <QString>
#include <QVariant>

#include <optional>
#include <vector>

namespace orvela {

/// The settings store cannot be written: the text names it.
class SettingsError : public CGenericEx {
public:
    SettingsError(const ErrorText& text, int line)
        : CGenericEx(text.english(), "SettingsEdit.cpp", line), mText(text) {}

    /// In the language of the user.
    QString shown() const { return mText.shown(); }

private:
    ErrorText mText;
};

/// A change of the settings store that is made whole or not at all. The store is opened for the change only.
class SettingsEdit {
public:
    /// Will write `value` under `key`.
    void set(const QString& key, const QVariant& value) { mChanges.push_back({key, value}); }

    /// Will take `key` away with everything below it.
    void remove(const QString& key) { mChanges.push_back({key, {}}); }

    /// Makes the changes in their order. What another process has written in the meantime stays. Before a
    /// settings file that holds anything else than settings is rewritten it is copied to a file beside it
    /// (the name followed by ".kept").
    /// @throws SettingsError when the store cannot be written; it then holds the old values
    void commit() const;

    /// A change: the value to write, none to remove.
    struct Change {
        QString key;
        std::optional<QVariant> value;
    };

private:
    std::vector<Change> mChanges;
};

} // namespace orvela
