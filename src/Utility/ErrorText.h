#pragma once

#include <QStringList>

namespace orvela {

/// What failed, with the file or the value and what to do: in English for the log and the command line, in
/// the language of the user where a window shows it.
class ErrorText {
public:
    /// @param context, text  marked for translation (QT_TRANSLATE_NOOP); they outlive this object
    /// @param values         of the places %1, %2 and %3 in the text, as many as it has
    ErrorText(const char* context, const char* text, const QStringList& values)
        : mContext(context), mText(text), mValues(values) {}

    QString english() const;
    QString shown() const;

private:
    QString filled(const QString& text) const;

    const char* mContext;
    const char* mText;
    QStringList mValues;
};

} // namespace orvela
