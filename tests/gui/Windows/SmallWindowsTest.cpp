#include "GUI/Windows/CDlgAboutImpl.h"
#include "GUI/Windows/CDlgDualPreviewImpl.h"
#include "GUI/Windows/CDlgProgramInfosImpl.h"
#include "GUI/Windows/CDlgSinglePreviewImpl.h"
#include "support/ModalDialog.h"

#include <QPushButton>
#include <QTest>

#include <gtest/gtest.h>

namespace {

template <typename P>
void expectToStay() {
    QWidget owner;
    owner.show();
    auto* preview = new P(&owner);
    EXPECT_TRUE(preview->isWindow());
    auto* view = new QWidget;
    preview->horizontalLayout->addWidget(view);
    preview->show();
    EXPECT_EQ(view->size(), preview->size());
    EXPECT_FALSE(preview->close());
    QTest::keyClick(preview, Qt::Key_Escape);
    EXPECT_TRUE(preview->isVisible());
    EXPECT_EQ(preview->windowTitle(), "Orvela Preview");
    EXPECT_FALSE(preview->windowIcon().isNull());
}

/// Runs the dialog, has it looked at and closed by its button and by Escape.
template <typename D>
void expectToShow(const QString& title) {
    for (const bool byKey : {true, false}) {
        auto* dialog = new D(nullptr);
        const orvela::ModalDialogs user([&](QDialog& shown) {
            EXPECT_EQ(shown.windowTitle(), title);
            EXPECT_TRUE(shown.isModal());
            EXPECT_EQ(shown.minimumSize(), shown.maximumSize());
            EXPECT_EQ(shown.windowFlags() & (Qt::WindowType_Mask | Qt::WindowStaysOnTopHint),
                      Qt::Tool | Qt::WindowStaysOnTopHint);
            for (const auto* label : shown.findChildren<QLabel*>()) {
                EXPECT_FALSE(label->text().isEmpty() && label->pixmap().isNull());
                EXPECT_FALSE(label->text().contains('%')) << "a place that nothing was put into";
                EXPECT_GE(label->height(), label->heightForWidth(label->width())) << "cut off";
            }
            byKey ? QTest::keyClick(&shown, Qt::Key_Escape)
                  : QTest::mouseClick(shown.findChild<QPushButton*>(), Qt::LeftButton);
        });
        dialog->exec();
        EXPECT_EQ(user.count, 1);
        delete dialog;
    }
}

} // namespace

TEST(SmallWindows, PreviewsRefuseToBeClosed) {
    expectToStay<CDlgDualPreviewImpl>();
    expectToStay<CDlgSinglePreviewImpl>();
}

TEST(SmallWindows, AboutAndInformationsTellOfTheProgram) {
    expectToShow<CDlgAboutImpl>("Kestrand Orvela 2.00");
    expectToShow<CDlgProgramInfosImpl>("Orvela Program Informations");
    EXPECT_TRUE(CDlgProgramInfosImpl(nullptr).lblContent->text().contains("Orvela 2.00"));
}
