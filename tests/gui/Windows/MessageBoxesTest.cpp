#include "GUI/Windows/MessageBoxes.h"

#include "Utility/DebugBoxes.h"
#include "support/BoxAnswer.h"

using namespace orvela;

TEST(MessageBoxes, ShowTheEnginesWarnings) {
    installMessageBoxes();
    QString shown;
    answerBox(QMessageBox::No, shown);
    EXPECT_EQ(DebugBoxes::warningBox(nullptr, QStringLiteral("Note:"), QStringLiteral("text"),
                                     QMessageBox::Yes | QMessageBox::No, QMessageBox::Yes),
              QMessageBox::No);
    DebugBoxes::setPresenter(nullptr);
    EXPECT_EQ(shown, QStringLiteral("Note:|text|Yes"));
}
