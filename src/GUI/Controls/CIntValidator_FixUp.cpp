#include "GUI/Controls/CIntValidator_FixUp.h"

#include <QRegularExpression>

QValidator::State CIntValidator_FixUp::validate(QString& text, int&) const {
    static const QRegularExpression digits(QStringLiteral("\\A\\d{1,8}\\z"));
    if (!digits.match(text).hasMatch())
        return Invalid;
    const int number = text.toInt();
    if (number < bottom())
        text = QString::number(bottom());
    else if (number > top())
        text = QString::number(top());
    return Acceptable;
}
