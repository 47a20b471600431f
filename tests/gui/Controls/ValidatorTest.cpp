#include "GUI/Controls/CDoubleValidator_FixUp.h"
#include "GUI/Controls/CIntValidator_FixUp.h"

#include <QStringList>

#include <gtest/gtest.h>

namespace {

void expectState(const QValidator& validator, QValidator::State state, const QStringList& texts) {
    int position = 0;
    for (QString text : texts)
        EXPECT_EQ(validator.validate(text, position), state) << qPrintable(text);
}

TEST(CIntValidator_FixUp, MovesNumbersIntoTheRangeAndRefusesEverythingElse) {
    const CIntValidator_FixUp validator(10, 255, nullptr);
    int position = 0;
    QStringList texts = {"300", "256", "255", "254", "10", "9", "0", "99999999"};
    for (QString& text : texts)
        EXPECT_EQ(validator.validate(text, position), QValidator::Acceptable) << qPrintable(text);
    EXPECT_EQ(texts, QStringList({"255", "255", "255", "254", "10", "10", "10", "255"}));
    expectState(validator, QValidator::Invalid,
                {"", "-1", "+1", "1.5", "12a", " 12", "12\n", "123456789", "٣"});
}

TEST(CDoubleValidator_FixUp, JudgesTheFormAndTheSign) {
    const CDoubleValidator_FixUp range(-0.1, 255, 1, nullptr);
    expectState(range, QValidator::Acceptable,
                {"0", "12", "-12.5", "5000", "-5000", ".5", "5.", "+7", "1e2", "1.25e1", "-1E+2", "1e999"});
    expectState(range, QValidator::Intermediate,
                {"", "-", ".", "-.", "e", "E5", "e+", "1e", "1E-", "1.5e+", "1.25", "-0.123"});
    expectState(range, QValidator::Invalid,
                {" 1", "1 ", "abc", "--1", "1e2e", "1ee", "xe5", "-e", "1.2.3", "nan", "inf", "1,5"});
    expectState(CDoubleValidator_FixUp(0, 100, 1, nullptr), QValidator::Invalid, {"-", "-1"});
}

} // namespace
