#include "GUI/Windows/MessageBoxes.h"

#include "Settings/EGUIMode.h"
#include "Utility/DebugBoxes.h"
#include "support/BoxAnswer.h"
#include "support/EnvironmentVariable.h"

#include <QDialog>

#include <thread>

using namespace orvela;

namespace {

/// The boxes as whoever starts the windows installs them.
class MessageBoxes : public testing::Test {
protected:
    MessageBoxes() { installMessageBoxes(); }
    ~MessageBoxes() override { DebugBoxes::setPresenter(nullptr); }
};

} // namespace

TEST_F(MessageBoxes, ShowTheEnginesWarnings) {
    QString shown;
    answerBox(QMessageBox::No, shown);
    EXPECT_EQ(DebugBoxes::warningBox(nullptr, QStringLiteral("Note:"), QStringLiteral("text"),
                                     QMessageBox::Yes | QMessageBox::No, QMessageBox::Yes),
              QMessageBox::No);
    EXPECT_EQ(shown, QStringLiteral("Note:|text|Yes"));
    std::thread([] {
        EXPECT_EQ(DebugBoxes::warningBox(nullptr, QStringLiteral("Note:"), QString()), DebugBoxes::Ok);
    }).join();
}

TEST_F(MessageBoxes, DebugBoxesLieAboveTheMainWindowElseAboveWhatIsWorkedWith) {
    const EnvironmentVariable shown("ORVELA_DEBUG_MBOX", "1");
    QWidget* parent = nullptr;
    QString said;
    const auto warn = [&] {
        QTimer::singleShot(0, qApp,
                           [&parent] { parent = QApplication::activeModalWidget()->parentWidget(); });
        answerBox(QMessageBox::Ok, said);
        getModeAsString(EGUIMode(99));
        return parent;
    };
    auto first = std::make_unique<QWidget>();
    setMainWindow(*first);
    EXPECT_EQ(warn(), first.get());
    EXPECT_TRUE(said.endsWith("Unknown mode in getModeAsString 99")) << qPrintable(said);
    auto second = std::make_unique<QWidget>();
    setMainWindow(*second);
    first.reset();
    EXPECT_EQ(DebugBoxes::mainWindow(), second.get());
    second.reset();
    EXPECT_EQ(DebugBoxes::mainWindow(), nullptr);
    QDialog dialog;
    QTimer::singleShot(0, &dialog, [&] {
        EXPECT_EQ(warn(), &dialog);
        dialog.close();
    });
    dialog.exec();
}

TEST_F(MessageBoxes, GoAwayWithTheirWindow) {
    auto* window = new QWidget;
    window->show();
    QTimer::singleShot(0, qApp, [window] { delete window; });
    EXPECT_EQ(DebugBoxes::warningBox(window, "Note:", "text", QMessageBox::Yes | QMessageBox::No),
              DebugBoxes::Ok);
    auto* closed = new QDialog;
    closed->setWindowFlag(Qt::Tool);
    QTimer::singleShot(50, closed, &QDialog::close);
    closed->exec();
    closed->deleteLater();
    QString said;
    answerBox(QMessageBox::No, said);
    EXPECT_EQ(DebugBoxes::warningBox(nullptr, "Note:", "text", QMessageBox::Yes | QMessageBox::No),
              QMessageBox::No);
}
