#include "GUI/Panes/IWgtPane.h"

#include "Core/CThreadedCore.h"
#include "GUI/Controls/CColorPicker.h"
#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Panes/CWgtPane3SlidersImpl.h"
#include "GUI/Panes/CWgtPaneAdvancedImpl.h"
#include "GUI/Panes/CWgtPaneFinalTouchImpl.h"
#include "GUI/Panes/CWgtPaneGenericImpl.h"
#include "GUI/Panes/TrackZones.h"
#include "PaneFixture.h"
#include "Settings/ModeTable.h"
#include "Utility/CARGBPlane.h"
#include "Utility/CGenericEx.h"
#include "support/ParamsText.h"
#include "support/SettingsMap.h"

#include <QFile>
#include <QRegularExpression>
#include <QToolButton>

#include <gmock/gmock.h>

#include <map>
#include <set>

using namespace orvela;

namespace {

/// A control of a pane, as data/panes.txt lists it; fields that it does not drive are "-".
struct Control {
    QString object;
    QString first; ///< what it shows before anything was set
    QString position;
    QString enabled;
    QString zones; ///< number of its set of track colours
};

std::vector<Control> controlsOf(EGUIMode mode) {
    QFile file(ORVELA_TEST_DATA "/panes.txt");
    EXPECT_TRUE(file.open(QIODevice::ReadOnly));
    std::vector<Control> controls;
    for (const QString& line : QString::fromUtf8(file.readAll()).split('\n')) {
        const QStringList parts = line.split(QStringLiteral(" | "));
        if (parts[0] == getModeAsString(mode))
            controls.push_back({parts.at(1), parts.at(2), parts.at(3), parts.at(4), parts.at(5)});
    }
    return controls;
}

std::vector<EGUIMode> modesWithPanes() {
    std::vector<EGUIMode> modes;
    for (const ModeDescription& mode : ModeTable::all())
        if (!PaneTable::sliders(mode.mode).empty())
            modes.push_back(mode.mode);
    return modes;
}

class IWgtPaneTest : public testing::TestWithParam<EGUIMode> {
protected:
    IWgtPane* make() {
        if (GetParam() == Mode_Advanced)
            return new CWgtPaneAdvancedImpl(&owner, GetParam());
        if (GetParam() == Mode_FinalTouch)
            return new CWgtPaneFinalTouchImpl(&owner, GetParam());
        if (isSingle)
            return new CWgtPaneGenericImpl(&owner, GetParam());
        return new CWgtPane3SlidersImpl(&owner, GetParam());
    }
    COrvelaSliderBlockImpl* block(const QString& object) const {
        return pane->findChild<COrvelaSliderBlockImpl*>(object);
    }
    CColorPicker* picker(const QString& object) const { return pane->findChild<CColorPicker*>(object); }
    void expectFirst() const;
    void expectWrites(bool odd);

    const bool isSingle = PaneTable::single(GetParam());
    const std::vector<Control> controls = controlsOf(GetParam());
    QWidget owner;
    IWgtPane* pane = make();
};

void IWgtPaneTest::expectFirst() const {
    for (const Control& control : controls) {
        SCOPED_TRACE(qPrintable(control.object));
        if (const CColorPicker* found = picker(control.object)) {
            EXPECT_EQ(found->color().name(), control.first);
            continue;
        }
        ASSERT_TRUE(block(control.object));
        EXPECT_EQ(block(control.object)->txtValue->text(), control.first);
        EXPECT_EQ(block(control.object)->isEnabled(), isSingle);
        EXPECT_EQ(block(control.object)->zoneStops(),
                  TrackZones::set(static_cast<ZoneSet>(control.zones.toInt())));
    }
}

// Gives every control a state of its own and expects those states, and nothing else, among the settings.
void IWgtPaneTest::expectWrites(bool odd) {
    CUserParams params;
    for (const SliderField& field : sliderFields())
        setField(params, field.name, field.value ? 3 : odd);
    CUserParams expected = params;
    const auto expect = [&expected](const QString& field, double value) {
        if (field != "-")
            setField(expected, field, value);
    };
    double position = odd ? 4 : -11;
    for (const auto& [object, first, value, enabled, zones] : controls) {
        if (CColorPicker* found = picker(object)) {
            const QColor color(9, odd ? 80 : 12, 200);
            found->setColor(color);
            expect(value + 'R', color.red());
            expect(value + 'G', color.green());
            expect(value + 'B', color.blue());
            continue;
        }
        const bool on = (int(position += 31) % 2 == 1) == odd;
        for (const double each : {0.0, 1000.0, position})
            block(object)->setValue(each);
        block(object)->setEnabled(!on);
        block(object)->setEnabled(on);
        expect(value, position); // not the one that the text tells
        expect(enabled, on);
    }
    pane->applyGUIParams(params);
    EXPECT_EQ(settingsOf(params.mSliderParams), settingsOf(expected.mSliderParams));
}

TEST_P(IWgtPaneTest, ShowsItsControlsAndWritesTheirFieldsAlone) {
    expectFirst();
    if (GetParam() != Mode_Advanced && !isSingle) { // there a preset brings factory settings, or nothing
        block(controls[0].object)->setEnabled(true);
        pane->setSliders(QStringLiteral("Automatic"));
        expectFirst();
    }
    expectWrites(false);
    expectWrites(true);
}

TEST_P(IWgtPaneTest, SlidersShowEveryPositionAndTellWhatTheyDo) {
    const auto sliders = PaneTable::sliders(GetParam());
    EXPECT_EQ(sliders.size() + PaneTable::colors(GetParam()).size(), controls.size());
    for (const PaneSlider& slider : sliders) {
        SCOPED_TRACE(slider.object);
        const SliderScale& scale = *slider.slider.scale;
        COrvelaSliderBlockImpl* shown = block(slider.object);
        for (int position = 0; position <= 1000; ++position) {
            shown->setValue(position);
            const QString text = shown->txtValue->text();
            EXPECT_NEAR(text.toDouble(), scale.toShown(position), 0.05 + 1e-9);
            EXPECT_EQ(scale.text(shown->value()), text);
            EXPECT_EQ(shown->exactValue(), position);
            Q_EMIT shown->txtValue->editingFinished();
            EXPECT_EQ(shown->txtValue->text(), text) << "inside the range";
        }
        EXPECT_EQ(shown->toolTip(), slider.slider.label);
        EXPECT_EQ(shown->whatsThis(), slider.slider.help);
        for (const QWidget* part : std::initializer_list<QWidget*>{shown->sldrValue, shown->txtValue}) {
            EXPECT_EQ(part->toolTip(), slider.slider.help);
            EXPECT_EQ(part->accessibleDescription(), slider.slider.help);
        }
    }
    for (const CColorPicker* each : pane->findChildren<CColorPicker*>())
        EXPECT_EQ(each->toolTip(), PaneTable::colors(GetParam()).front().color.help);
}

TEST_P(IWgtPaneTest, WhatADragLeavesComesBackExactly) {
    for (const PaneSlider& slider : PaneTable::sliders(GetParam())) {
        SCOPED_TRACE(slider.object);
        COrvelaSliderBlockImpl* moved = block(slider.object);
        moved->setEnabled(true);
        for (int position = 0; position <= 1000; position += 3) {
            for (const double each : {500.0, position + 0.37}) // the second is often not told from a third
                moved->sldrValue->moveTo(each);
            const double stored = moved->exactValue();
            EXPECT_NEAR(stored, moved->value(), 1e-9) << "the position that the text tells";
            moved->setValue(250);
            moved->setValue(stored);
            EXPECT_EQ(moved->exactValue(), stored);
        }
    }
}

TEST_P(IWgtPaneTest, RowsStandInOneGrid) {
    auto* column = new QVBoxLayout(&owner);
    column->addWidget(pane);
    owner.resize(320, 900);
    owner.show();
    if (auto* extend = pane->findChild<QToolButton*>("btnExtendSettings"))
        extend->click();
    for (const Control& control : controls)
        if (COrvelaSliderBlockImpl* each = block(control.object))
            each->setEnabled(true);
    std::set<int> lefts;
    std::set<int> rights;
    std::map<QWidget*, std::set<int>> rowsOf;
    const auto tabs = pane->findChildren<QTabWidget*>();
    for (int tab = 0; tab < 4; ++tab) {
        for (QTabWidget* each : tabs)
            each->setCurrentIndex(tab);
        QCoreApplication::processEvents();
        for (COrvelaSliderBlockImpl* each : pane->findChildren<COrvelaSliderBlockImpl*>()) {
            if (!each->isVisible())
                continue;
            lefts.insert(each->sldrValue->mapTo(pane, QPoint(0, 0)).x());
            rights.insert(each->txtValue->mapTo(pane, QPoint(each->txtValue->width(), 0)).x());
            rowsOf[each->parentWidget()].insert(each->y());
        }
        for (CColorPicker* each : pane->findChildren<CColorPicker*>()) {
            if (each->isVisible())
                lefts.insert(each->mapTo(pane, QPoint(CColorPicker::kSwatchLeft, 0)).x());
        }
    }
    EXPECT_EQ(lefts.size(), 1u) << testing::PrintToString(lefts);
    EXPECT_EQ(rights.size(), 1u) << testing::PrintToString(rights);
    std::set<int> pitches;
    for (const auto& [group, rows] : rowsOf)
        for (auto row = rows.begin(); std::next(row) != rows.end(); ++row)
            pitches.insert(*std::next(row) - *row);
    EXPECT_LE(pitches.size(), 1u) << testing::PrintToString(pitches);
}

TEST_P(IWgtPaneTest, MakesItsCoreAndLeadsOnOnceARunWasCompleted) {
    const bool touch = GetParam() == Mode_FinalTouch;
    CARGBPlane in(16, 16, QStringLiteral("in"));
    CARGBPlane out(16, 16, QStringLiteral("out"));
    CThreadedCore* core = pane->createCore(&in, &out, pane);
    EXPECT_STREQ(core->metaObject()->className(),
                 touch ? "CThreadedCore_FinalTouch" : "CThreadedCore_Orvela");
    auto* button = pane->findChild<QAbstractButton*>(touch ? "btnBack" : "btnFinalTouch");
    if (!button)
        return;
    Q_EMIT core->started();
    EXPECT_FALSE(button->isEnabled());
    Q_EMIT core->finished();
    EXPECT_FALSE(button->isEnabled()) << "no run was completed";
    QObject::connect(core, &CThreadedCore::stepDone, core, &CThreadedCore::stepHandled);
    core->setParams(CUserParamsPhotoshop(GetParam()));
    core->run();
    Q_EMIT core->terminated();
    EXPECT_TRUE(button->isEnabled());
}

INSTANTIATE_TEST_SUITE_P(All, IWgtPaneTest, testing::ValuesIn(modesWithPanes()), [](const auto& mode) {
    return getModeAsString(mode.param).remove(QRegularExpression("\\W")).toStdString();
});

TEST(IWgtPane, NamesTheControlThatItsFormLacks) {
    const Shown<CWgtPane3SlidersImpl> shown(Mode_SmartLevels);
    delete shown.pane->sldr2;
    CUserParams params;
    EXPECT_THAT([&] { shown.pane->applyGUIParams(params); },
                testing::ThrowsMessage<CGenericEx>("The form of CWgtPane3SlidersImpl has no control sldr2."));
}

} // namespace
