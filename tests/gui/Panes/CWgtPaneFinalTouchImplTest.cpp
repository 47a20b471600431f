#include "GUI/Panes/CWgtPaneFinalTouchImpl.h"

#include "GUI/Controls/CColorPicker.h"
#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "PaneFixture.h"

#include <QAccessible>
#include <QComboBox>
#include <QTest>

#include <gtest/gtest.h>

using namespace orvela;

TEST(CWgtPaneFinalTouchImpl, ColorFiltersAndPickersMirrorEachOther) {
    const Shown<CWgtPaneFinalTouchImpl> shown(Mode_FinalTouch);
    CWgtPaneFinalTouchImpl* const pane = shown.pane;
    COrvelaSliderBlockImpl* const sliders[] = {pane->sldrPercColorFilter, pane->sldrAbsColorFilter};
    CColorPicker* const pickers[] = {pane->colrPickPercColorFilter, pane->colrPickAbsColorFilter};
    for (const int from : {0, 1}) {
        const int to = 1 - from;
        pane->tabCtnrFinalTouch->setCurrentIndex(from);
        EXPECT_FALSE(pickers[from]->isVisible());
        sliders[from]->setEnabled(true);
        EXPECT_TRUE(sliders[to]->isEnabled());
        EXPECT_TRUE(pickers[from]->isVisible());
        sliders[from]->txtValue->selectAll();
        QTest::keyClicks(sliders[from]->txtValue, from == 0 ? "12.3" : "45.6");
        EXPECT_EQ(sliders[from]->txtValue->text(), QLatin1String(from == 0 ? "12.3" : "45.6"));
        EXPECT_NEAR(sliders[to]->value(), from == 0 ? 123 : 456, 1e-9);
        sliders[from]->setValue(501.17);
        EXPECT_EQ(sliders[to]->exactValue(), 501.17) << "which the text does not tell";
        CThinHorizontalSlider* thin = sliders[from]->sldrValue;
        QTest::mouseClick(thin, Qt::LeftButton, {}, QPoint(thin->width() / 3, 3));
        EXPECT_GT(sliders[to]->value(), 300);
        EXPECT_EQ(sliders[to]->value(), sliders[from]->value());
        pickers[from]->setColor(QColor(from, 20, 30));
        EXPECT_EQ(pickers[to]->color(), QColor(from, 20, 30));
        sliders[from]->setEnabled(false);
        EXPECT_FALSE(sliders[to]->isEnabled() || pickers[from]->isVisible());
        pane->setSliders(QString());
    }
}

TEST(CWgtPaneFinalTouchImpl, NamesItsPresetAndItsTabs) {
    const Shown<CWgtPaneFinalTouchImpl> shown(Mode_FinalTouch);
    QComboBox list;
    shown.pane->fillPresetList(&list);
    ASSERT_EQ(list.count(), 1);
    EXPECT_EQ(list.itemText(0), "Automatic");
    EXPECT_FALSE(list.itemIcon(0).isNull());
    QTabBar* const tabs = shown.pane->tabCtnrAbsRGB->tabBar();
    EXPECT_EQ(QAccessible::queryAccessibleInterface(tabs)->child(3)->text(QAccessible::Name), "All channels");
}
