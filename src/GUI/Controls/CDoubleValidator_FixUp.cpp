#include "GUI/Controls/CDoubleValidator_FixUp.h"

#include <QRegularExpression>

#include <cmath>

namespace {

// True when the text reads as a finite number; the words for infinity and "not a number" are none.
bool isNumber(const QString& text) {
    bool ok = false;
    const double number = text.toDouble(&ok);
    return ok && std::isfinite(number);
}

// The state of a text that is not a number; Acceptable when nothing speaks against it yet.
QValidator::State exponentState(const QString& text, qsizetype exponents) {
    static const QRegularExpression exponent(QStringLiteral("[Ee][+-]?(\\d*)\\z"));
    const QRegularExpressionMatch match = exponent.match(text);
    if (match.hasMatch() && match.capturedStart() == 0)
        return QValidator::Intermediate;
    if (!match.hasMatch() || exponents > 1 || !isNumber(text.left(match.capturedStart())))
        return QValidator::Invalid;
    return match.captured(1).isEmpty() ? QValidator::Intermediate : QValidator::Acceptable;
}

} // namespace

QValidator::State CDoubleValidator_FixUp::validate(QString& text, int&) const {
    static const QRegularExpression start(QStringLiteral("\\A-?\\.?\\z"));
    static const QRegularExpression fraction(QStringLiteral("\\.(\\d*)"));
    if (text.contains(QLatin1Char(' ')) || (text.startsWith(QLatin1Char('-')) && bottom() >= 0))
        return Invalid;
    if (start.match(text).hasMatch())
        return Intermediate;
    const qsizetype exponents = text.count(QLatin1Char('e'), Qt::CaseInsensitive);
    if (!isNumber(text)) {
        const State state = exponentState(text, exponents);
        if (state != Acceptable)
            return state;
    }
    if (exponents == 0 && fraction.match(text).capturedLength(1) > decimals())
        return Intermediate;
    return Acceptable;
}

void CDoubleValidator_FixUp::fixup(QString& text) const {
    text = isNumber(text) ? QString::number(text.toDouble(), 'f', decimals()) : QString::number(bottom());
}
