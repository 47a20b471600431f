#include "PaneFixture.h"

#include "Core/CThreadedCore.h"
#include "Settings/SettingFields.h"
#include "Utility/CARGBPlane.h"
#include "Utility/DebugBoxes.h"

#include <QSignalSpy>

#include <gtest/gtest.h>

#include <cmath>

namespace orvela {

namespace {

QStringList gBoxes;

int record(void*, const QString& title, const QString& text, int, int) {
    gBoxes.append(title + QLatin1Char('|') + text);
    return DebugBoxes::Ok;
}

void set(CSliderParams& settings, const std::string& field, double value) {
    const SliderField* found = SettingFields::find(field);
    ASSERT_TRUE(field.empty() || found) << field;
    if (found && found->value)
        settings.*found->value = static_cast<float>(value);
    else if (found)
        settings.*found->flag = value != 0;
}

} // namespace

COrvelaSliderBlockImpl* blockOf(const QWidget* pane, const std::string& object) {
    return pane->findChild<COrvelaSliderBlockImpl*>(QString::fromStdString(object));
}

void expectWrites(IWgtPane* pane, const std::vector<Drives>& sliders, const std::string& colorField,
                  const QColor& color) {
    for (const bool odd : {false, true}) {
        CUserParams params;
        for (const SliderField& field : sliderFields())
            set(params.mSliderParams, field.name, field.value ? 3 : odd);
        CSliderParams expected = params.mSliderParams;
        for (std::size_t i = 0; i < sliders.size(); ++i) {
            COrvelaSliderBlockImpl* block = blockOf(pane, sliders[i].object);
            ASSERT_TRUE(block) << sliders[i].object;
            block->setValue(20.0 + 31.0 * double(i) + (odd ? 15 : 0));
            block->setEnabled((i % 2 == 1) == odd);
            set(expected, sliders[i].value, block->value());
            set(expected, sliders[i].enabled, (i % 2 == 1) == odd);
        }
        if (!colorField.empty()) {
            set(expected, colorField + 'R', color.red());
            set(expected, colorField + 'G', color.green());
            set(expected, colorField + 'B', color.blue());
        }
        pane->applyGUIParams(params);
        for (const SliderField& field : sliderFields()) {
            if (field.value)
                EXPECT_EQ(params.mSliderParams.*field.value, expected.*field.value) << field.name;
            else
                EXPECT_EQ(params.mSliderParams.*field.flag, expected.*field.flag) << field.name;
        }
    }
}

double snapping(const SliderScale& scale, double position) {
    const double shown = scale.toShown(position);
    return 1e-6 + std::max(std::abs(scale.toPosition(shown + 0.05) - position),
                           std::abs(scale.toPosition(shown - 0.05) - position));
}

void expectShowsEveryPosition(const QWidget* pane, const PaneSlider& slider) {
    SCOPED_TRACE(slider.object);
    const SliderScale& scale = *slider.slider.scale;
    COrvelaSliderBlockImpl* block = blockOf(pane, slider.object);
    ASSERT_TRUE(block);
    for (int position = 0; position <= 1000; ++position) {
        block->setValue(position);
        const QString text = block->txtValue->text();
        EXPECT_NEAR(text.toDouble(), scale.toShown(position), 0.05 + 1e-9);
        EXPECT_NEAR(block->value(), position, snapping(scale, position));
        Q_EMIT block->txtValue->editingFinished();
        EXPECT_EQ(block->txtValue->text(), text) << "inside the range";
    }
}

void expectLeadsOn(IWgtPane* pane, QAbstractButton* button, const char* coreClass, EGUIMode mode) {
    QSignalSpy changed(pane, &IWgtPane::changeMode);
    CARGBPlane in(16, 16, QStringLiteral("in"));
    CARGBPlane out(16, 16, QStringLiteral("out"));
    CThreadedCore* core = pane->createCore(&in, &out, pane);
    EXPECT_STREQ(core->metaObject()->className(), coreClass);
    EXPECT_EQ(core->parent(), pane);
    Q_EMIT core->started();
    button->click();
    Q_EMIT core->finished();
    button->click();
    EXPECT_EQ(changed.count(), 0) << "no run was completed";
    QObject::connect(core, &CThreadedCore::stepDone, core, &CThreadedCore::stepHandled);
    core->setParams(CUserParamsPhotoshop(pane->mode()));
    core->run();
    Q_EMIT core->terminated();
    button->click();
    ASSERT_EQ(changed.count(), 1);
    EXPECT_EQ(changed[0][0].value<EGUIMode>(), mode);
}

QStringList boxes(const std::function<void()>& action) {
    gBoxes.clear();
    DebugBoxes::setPresenter(record);
    action();
    DebugBoxes::setPresenter(nullptr);
    return gBoxes;
}

} // namespace orvela
