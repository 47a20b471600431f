#include "GUI/Controls/CDoubleValidator_FixUp.h"

#include "ValidatorStates.h"

using namespace orvela;

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
