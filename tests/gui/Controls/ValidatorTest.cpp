#include "GUI/Controls/CDoubleValidator_FixUp.h"
#include "GUI/Controls/CIntValidator_FixUp.h"

#include <gtest/gtest.h>

namespace {

QValidator::State stateOf(const QValidator& validator, const char* text) {
    QString typed = QString::fromUtf8(text);
    int position = 0;
    return validator.validate(typed, position);
}

TEST(CIntValidator_FixUp, MovesNumbersIntoTheRangeAndRefusesEverythingElse) {
    const CIntValidator_FixUp validator(10, 255, nullptr);
    int position = 0;
    const std::pair<const char*, const char*> moved[] = {{"300", "255"},     {"256", "255"}, {"255", "255"},
                                                         {"10", "10"},       {"9", "10"},    {"0", "10"},
                                                         {"99999999", "255"}};
    for (const auto& [typed, expected] : moved) {
        QString text = QString::fromUtf8(typed);
        EXPECT_EQ(validator.validate(text, position), QValidator::Acceptable) << typed;
        EXPECT_EQ(text.toStdString(), expected) << typed;
    }
    for (const char* text : {"", "-1", "+1", "1.5", "12a", " 12", "12\n", "123456789", "٣"})
        EXPECT_EQ(stateOf(validator, text), QValidator::Invalid) << text;
}

TEST(CDoubleValidator_FixUp, JudgesTheFormOnly) {
    const CDoubleValidator_FixUp signedRange(-255, 255, 1, nullptr);
    for (const char* text :
         {"0", "12", "-12.5", "5000", "-5000", ".5", "5.", "+7", "1e2", "1.25e1", "-1E+2", "1e999"})
        EXPECT_EQ(stateOf(signedRange, text), QValidator::Acceptable) << text;
    for (const char* text : {"", "-", ".", "-.", "e", "E5", "e+", "1e", "1E-", "1.5e+", "1.25", "-0.123"})
        EXPECT_EQ(stateOf(signedRange, text), QValidator::Intermediate) << text;
    for (const char* text :
         {" 1", "1 ", "abc", "--1", "1e2e", "1ee", "xe5", "-e", "1.2.3", "nan", "inf", "1,5"})
        EXPECT_EQ(stateOf(signedRange, text), QValidator::Invalid) << text;
}

TEST(CDoubleValidator_FixUp, RefusesTheMinusSignWhereNothingIsNegative) {
    EXPECT_EQ(stateOf(CDoubleValidator_FixUp(0, 100, 1, nullptr), "-"), QValidator::Invalid);
    EXPECT_EQ(stateOf(CDoubleValidator_FixUp(0, 100, 1, nullptr), "-1"), QValidator::Invalid);
    EXPECT_EQ(stateOf(CDoubleValidator_FixUp(-0.1, 100, 1, nullptr), "-1"), QValidator::Acceptable);
}

} // namespace
