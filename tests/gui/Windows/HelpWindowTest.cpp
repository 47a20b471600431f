#include "GUI/Windows/HelpWindow.h"

#include "Platform/HelpViewer.h"
#include "Settings/SettingsStore.h"
#include "support/BoxRecorder.h"
#include "support/EnvironmentVariable.h"

#include <QApplication>
#include <QDialog>
#include <QDir>
#include <QFile>
#include <QLabel>
#include <QLineEdit>
#include <QMessageBox>
#include <QScrollBar>
#include <QTest>
#include <QTextBlock>
#include <QTextBrowser>
#include <QToolButton>
#include <QTreeWidget>

#include <gtest/gtest.h>

#include <memory>

using namespace orvela;

namespace {

HelpWindow* shownHelp() {
    for (QWidget* each : QApplication::topLevelWidgets())
        if (auto* help = qobject_cast<HelpWindow*>(each); help && help->isVisible())
            return help;
    return nullptr;
}

/// A window with its help opened.
class HelpWindowTest : public testing::Test {
protected:
    void SetUp() override {
        owner->show();
        open("welcome.htm");
    }
    void TearDown() override {
        if (HelpWindow* help = shownHelp())
            help->close();
    }

    void open(const char* topic) {
        openHelp(QLatin1String(topic), owner.get());
        ASSERT_TRUE(shownHelp() && QTest::qWaitForWindowActive(shownHelp()));
    }
    static QTextBrowser& page() { return *shownHelp()->findChild<QTextBrowser*>(); }
    static QTreeWidget& contents() { return *shownHelp()->findChild<QTreeWidget*>(); }
    static QLineEdit& searchField() { return *shownHelp()->findChild<QLineEdit*>(); }
    static QString address() { return page().source().toString(); }
    static QString selected() { return page().textCursor().selectedText(); }
    static void press(Qt::Key key, Qt::KeyboardModifiers modifiers = {}) {
        QTest::keyClick(shownHelp()->windowHandle(), key, modifiers);
    }
    /// Clicks as a mouse does: a window that a modal one blocks gets nothing.
    static void clickEntry(const char* title) {
        QTreeWidgetItem* entry =
            contents().findItems(QLatin1String(title), Qt::MatchExactly | Qt::MatchRecursive).value(0);
        ASSERT_TRUE(entry) << title;
        const QPoint inView = contents().visualItemRect(entry).center();
        QTest::mouseClick(shownHelp()->windowHandle(), Qt::LeftButton, {},
                          contents().viewport()->mapTo(shownHelp(), inView));
    }

    std::unique_ptr<QDialog> owner = std::make_unique<QDialog>();
};

QPalette darkPalette() {
    QPalette dark(QColor(53, 53, 53));
    dark.setColor(QPalette::Base, QColor(35, 35, 35));
    return dark;
}

} // namespace

TEST_F(HelpWindowTest, GoesToTopicsBackAndForward) {
    const HelpWindow* first = shownHelp();
    EXPECT_EQ(address(), QStringLiteral("qrc:/manual/welcome.htm"));
    open("finaltouch.htm");
    EXPECT_EQ(shownHelp(), first);
    EXPECT_EQ(address(), QStringLiteral("qrc:/manual/finaltouch.htm"));
    EXPECT_EQ(contents().currentItem()->text(0), QStringLiteral("Final Touch"));
    press(Qt::Key_Left, Qt::AltModifier);
    EXPECT_EQ(address(), QStringLiteral("qrc:/manual/welcome.htm"));
    press(Qt::Key_Right, Qt::AltModifier);
    EXPECT_EQ(address(), QStringLiteral("qrc:/manual/finaltouch.htm"));
    press(Qt::Key_Home, Qt::AltModifier);
    EXPECT_EQ(address(), QStringLiteral("qrc:/manual/welcome.htm"));
    press(Qt::Key_Escape);
    EXPECT_FALSE(shownHelp());
}

TEST_F(HelpWindowTest, ContentsLeadToSectionsAndShowWhereThePageIs) {
    clickEntry("Adjustments");
    EXPECT_EQ(address(), QStringLiteral("qrc:/manual/adjustments.htm"));
    clickEntry("Dark");
    EXPECT_EQ(address(), QStringLiteral("qrc:/manual/adjustments.htm#dark"));
    EXPECT_GT(page().verticalScrollBar()->value(), 0);
    page().setSource(QUrl(QStringLiteral("qrc:/manual/advancedenhancementoptions.htm#moire")));
    EXPECT_EQ(contents().currentItem()->text(0), QStringLiteral("Moire"));
    EXPECT_TRUE(contents().visualItemRect(contents().currentItem()).isValid());
    EXPECT_TRUE(page().openExternalLinks());
}

TEST_F(HelpWindowTest, FindsTextForwardsBackwardsAndRoundTheEnd) {
    open("illumination.htm");
    press(Qt::Key_F, Qt::ControlModifier);
    EXPECT_TRUE(searchField().hasFocus());
    QTest::keyClicks(&searchField(), QStringLiteral("beyond"));
    EXPECT_EQ(selected(), QStringLiteral("Beyond"));
    const int only = page().textCursor().position();
    press(Qt::Key_Return);
    EXPECT_EQ(page().textCursor().position(), only); // once round
    searchField().clear();
    QTest::keyClicks(&searchField(), QStringLiteral("light"));
    const int first = page().textCursor().position();
    press(Qt::Key_F3);
    const int second = page().textCursor().position();
    EXPECT_NE(second, first);
    press(Qt::Key_F3, Qt::ShiftModifier);
    EXPECT_EQ(page().textCursor().position(), first);

    QTest::keyClicks(&searchField(), QStringLiteral("houses of parliament"));
    const auto* missing = shownHelp()->findChild<QLabel*>();
    EXPECT_EQ(missing->text(), QStringLiteral("Not on this page"));
    searchField().clear();
    QTest::keyClicks(&searchField(), QStringLiteral("l"));
    EXPECT_EQ(missing->text(), QString());
    press(Qt::Key_Escape);
    EXPECT_TRUE(shownHelp() && page().hasFocus());
}

// The owner is a modal window over the main one, as in the filter.
TEST_F(HelpWindowTest, CanBeUsedBesideModalWindows) {
    QDialog modal(owner.get());
    QToolButton helpButton(&modal);
    helpButton.setObjectName(QStringLiteral("btnHelp"));
    modal.open();
    ASSERT_TRUE(QTest::qWaitFor([&] { return shownHelp() && shownHelp()->parentWidget() == &modal; }));
    clickEntry("Final Touch");
    EXPECT_EQ(address(), QStringLiteral("qrc:/manual/finaltouch.htm"));

    QMessageBox question(QMessageBox::Question, {}, QStringLiteral("?"), QMessageBox::Yes, &modal);
    question.open();
    ASSERT_TRUE(QTest::qWaitForWindowExposed(&question));
    EXPECT_EQ(shownHelp()->parentWidget(), &modal); // does not cover the question
    clickEntry("Adjustments");
    EXPECT_EQ(address(), QStringLiteral("qrc:/manual/finaltouch.htm"));
    question.accept();

    modal.accept();
    ASSERT_TRUE(shownHelp());
    EXPECT_EQ(shownHelp()->parentWidget(), owner.get());
    clickEntry("Adjustments");
    EXPECT_EQ(address(), QStringLiteral("qrc:/manual/adjustments.htm"));
    owner->hide();
    EXPECT_FALSE(shownHelp());
}

TEST_F(HelpWindowTest, ChangesTheSizeOfItsText) {
    const auto height = [] { return page().document()->size().height(); };
    const double before = height();
    press(Qt::Key_Plus, Qt::ControlModifier);
    const double larger = height();
    EXPECT_GT(larger, before);
    press(Qt::Key_Minus, Qt::ControlModifier);
    press(Qt::Key_Minus, Qt::ControlModifier);
    EXPECT_LT(height(), before);
}

TEST_F(HelpWindowTest, RemembersItsPlace) {
    shownHelp()->setGeometry(40, 50, 700, 500);
    shownHelp()->close();
    owner = std::make_unique<QDialog>(); // takes the window along
    owner->show();
    open("welcome.htm");
    EXPECT_EQ(shownHelp()->geometry(), QRect(40, 50, 700, 500));
    const QString store = openSettings().fileName();
    QFile::remove(store);
    ASSERT_TRUE(QDir().mkpath(store)); // which keeps it from being written
    const QStringList told = boxes([] { shownHelp()->close(); });
    ASSERT_EQ(told.size(), 1);
    EXPECT_TRUE(told.first().contains(store));
    ASSERT_TRUE(QDir().rmdir(store));
}

TEST_F(HelpWindowTest, TakesTheColoursOfThePalette) {
    open("adjustments.htm");
    page().verticalScrollBar()->setValue(300);
    const QPalette before = QApplication::palette();
    for (const QPalette& palette : {darkPalette(), before}) {
        QApplication::setPalette(palette);
        QCoreApplication::processEvents();
        EXPECT_EQ(page().verticalScrollBar()->value(), 300);
        const int paper = palette.color(QPalette::Base).lightness();
        for (QTextBlock block = page().document()->begin(); block.isValid(); block = block.next()) {
            if (block.text().isEmpty())
                continue;
            const QColor ink = block.begin().fragment().charFormat().foreground().color();
            EXPECT_GT(std::abs(ink.lightness() - paper), 100) << qPrintable(block.text());
        }
    }
}

TEST_F(HelpWindowTest, ShowsItsOwnPagesWhereTheCompiledManualIsMissing) {
    shownHelp()->close();
    const EnvironmentVariable debug("ORVELA_DEBUG_MBOX", "1");
    const QStringList shown = boxes([&] { openHelp(QStringLiteral("welcome.htm"), owner.get()); });
    EXPECT_EQ(shown, QStringList(QStringLiteral("Warning|Help file missing:") +
                                 QCoreApplication::applicationDirPath() +
                                 QLatin1String(HelpViewer::kCompiledManual)));
    EXPECT_TRUE(shownHelp());
    EXPECT_FALSE(HelpViewer::show(nullptr, "OrvelaManual.chm::/welcome.htm"));
}
