#pragma once

#include <QDoubleValidator>

/// Checks the form of a decimal number while it is typed. Numbers outside the range pass: the slider block
/// deals with them when editing finishes. Numbers have a decimal point in every locale.
class CDoubleValidator_FixUp : public QDoubleValidator {
    Q_OBJECT

public:
    using QDoubleValidator::QDoubleValidator;

    State validate(QString& text, int& position) const override;

    /// Completes a text that was left unfinished: a number is cut to the decimals allowed, anything else
    /// becomes the bottom of the range.
    void fixup(QString& text) const override;
};
