#include "GUI/Controls/CIntValidator_FixUp.h"

#include "ValidatorStates.h"

using namespace orvela;

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
