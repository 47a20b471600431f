#include "GUI/Windows/CDlgSettingsImpl.h"

#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "gui/Windows/ProcessingWindow.h"

#include <QGraphicsView>

#include <gtest/gtest.h>

using namespace orvela;

namespace {

std::unique_ptr<CARGBPlane> picture() {
    return testplanes::make(96, 64, [](int x, int y) {
        return testplanes::Pixel{std::uint8_t(40 + x), std::uint8_t(30 + x + y), std::uint8_t(20 + 2 * y)};
    });
}

void grabAll(const char* tag) {
    const QByteArray folder = qgetenv("ORVELA_GRAB");
    if (folder.isEmpty())
        return;
    for (QWidget* window : QApplication::topLevelWidgets())
        if (window->isVisible())
            window->grab().save(QString::fromLocal8Bit(folder) + QLatin1Char('/') + QLatin1String(tag) + window->objectName() + window->windowTitle().left(9) + QStringLiteral(".png"));
}

TEST(CDlgSettingsImpl, AnAutomaticModeRunsByItselfAndAppliesTheEnginesResult) {
    ProcessingWindow opened(Mode_Automatic, picture());
    opened.run();
    EXPECT_TRUE(opened.window.appliesOnFinish());
    EXPECT_EQ(opened.window.result(), QDialog::Accepted);
    EXPECT_EQ(testplanes::bytes(opened.output), opened.engineResult(CUserParamsPhotoshop(Mode_Automatic)));
}

TEST(CDlgSettingsImpl, OkAfterARefreshAcceptsWithoutAnotherRun) {
    ProcessingWindow opened(Mode_Advanced, picture());
    opened.run([&] {
        grabAll("a-");
        opened.click("btnRefresh");
        grabAll("b-");
        opened.click("btnOK");
    });
    EXPECT_TRUE(opened.window.appliesOnFinish());
    EXPECT_EQ(opened.window.result(), QDialog::Accepted);
}

} // namespace
