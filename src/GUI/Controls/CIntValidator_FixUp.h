#pragma once

#include <QIntValidator>

/// Accepts one to eight digits and moves a number outside the range to the nearer end of it while it is
/// typed.
class CIntValidator_FixUp : public QIntValidator {
    Q_OBJECT

public:
    using QIntValidator::QIntValidator;

    /// Invalid for anything but one to eight digits (an empty text too), else Acceptable; `text` is replaced
    /// by the bottom or the top when its number lies outside.
    State validate(QString& text, int& position) const override;
};
