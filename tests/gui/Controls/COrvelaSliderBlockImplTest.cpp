// What a slider block does as a user works with it: data/slider_block/*.txt. A line is an action and what is
// so after it: the text, the position (the exact one, if another; dragged; off), where the focus is, and what
// the block told meanwhile.

#include "GUI/Controls/COrvelaSliderBlockImpl.h"

#include "Painted.h"

#include <QAccessible>
#include <QApplication>
#include <QClipboard>
#include <QDir>
#include <QTest>
#include <QToolTip>
#include <QVBoxLayout>
#include <QWheelEvent>

#include <gtest/gtest.h>

#include <cmath>
#include <functional>
#include <map>

using namespace orvela;

namespace {

const QString kTables = QStringLiteral(ORVELA_TEST_DATA "/slider_block/");

/// A block with the scale "tenth" (0 to 100), shown in an active window with a second block below it.
class COrvelaSliderBlockImplTest : public testing::Test {
protected:
    COrvelaSliderBlockImplTest() {
        auto* layout = new QVBoxLayout(&window);
        layout->addWidget(&block);
        layout->addWidget(&next);
        block.setScale(SliderScales::Tenth);
        block.setMinMax(0, 100);
        block.setText(QStringLiteral("Fade"));
        slider()->setFixedWidth(101);
        QObject::connect(&block, &COrvelaSliderBlockImpl::valueChanged,
                         [this](double value) { told << QString::number(value); });
        QObject::connect(&block, &COrvelaSliderBlockImpl::stateChanged,
                         [this](bool on) { told << (on ? "on" : "off"); });
        window.show();
        window.activateWindow();
        EXPECT_TRUE(QTest::qWaitForWindowActive(&window));
        slider()->setFocus();
    }

    CThinHorizontalSlider* slider() const { return block.sldrValue; }
    QString text() const { return block.txtValue->text(); }
    void setScale(const QString& what);
    void select();
    void click(QWidget* part, Qt::MouseButton button);
    void doubleClick(QWidget* part, Qt::MouseButton button);
    void wheel(const QStringList& what);
    void dragWithout(int x);
    static void key(const QString& key);
    /// A pixel of the slider as a point of the row, above it.
    QPoint inRow(const QString& x) const { return {slider()->x() + x.toInt(), 1}; }
    std::string state() const;

    QStringList told;
    QWidget window;
    COrvelaSliderBlockImpl block{&window};
    COrvelaSliderBlockImpl next{&window};
    const std::map<QString, QWidget*> parts = {{"lamp", block.lmpState},     {"name", block.lblName},
                                               {"slider", slider()},         {"text", block.txtValue},
                                               {"next lamp", next.lmpState}, {"next slider", next.sldrValue},
                                               {"next text", next.txtValue}};
    using Text = const QString&;
    static constexpr Qt::MouseButton kLeft = Qt::LeftButton;
    static constexpr Qt::MouseButton kRight = Qt::RightButton;
    const std::map<QString, std::function<void(Text)>> actions = {
        {"scale", [this](Text what) { setScale(what); }},
        {"set", [this](Text position) { block.setValue(position.toDouble()); }},
        {"show", [this](Text number) { block.setVirtualValue(number.toDouble()); }},
        {"switch", [this](Text to) { block.setEnabled(to == "on"); }},
        {"window", [this](Text to) { window.setEnabled(to == "on"); }},
        {"focus", [this](Text part) { parts.at(part)->setFocus(); }},
        {"key", [](Text sequence) { key(sequence); }},
        {"type", [this](Text keys) { select(), QTest::keyClicks(block.txtValue, keys); }},
        {"paste",
         [this](Text text) { select(), QApplication::clipboard()->setText(text), block.txtValue->paste(); }},
        {"tip", [this](Text) { told << QToolTip::text(); }},
        {"click", [this](Text part) { click(parts.at(part), kLeft); }},
        {"right-click", [this](Text part) { click(parts.at(part), kRight); }},
        {"double", [this](Text part) { doubleClick(parts.at(part), kLeft); }},
        {"right-double", [this](Text part) { doubleClick(parts.at(part), kRight); }},
        {"right-move", [this](Text x) { dragWithout(x.toInt()); }},
        {"wheel", [this](Text what) { wheel(what.split(' ')); }},
        {"press", [this](Text x) { QTest::mousePress(slider(), kLeft, {}, QPoint(x.toInt(), 3)); }},
        {"move", [this](Text x) { QTest::mouseMove(slider(), QPoint(x.toInt(), 3)); }},
        {"release", [this](Text x) { QTest::mouseRelease(slider(), kLeft, {}, QPoint(x.toInt(), 3)); }},
        {"row-press", [this](Text x) { QTest::mousePress(&block, kLeft, {}, inRow(x)); }},
        {"row-move", [this](Text x) { QTest::mouseMove(&block, inRow(x)); }},
        {"row-release", [this](Text x) { QTest::mouseRelease(&block, kLeft, {}, inRow(x)); }}};
};

void COrvelaSliderBlockImplTest::setScale(const QString& what) {
    const QStringList words = what.split(' ');
    const std::map<QString, SliderScale> scales = {{"Shadows", SliderScales::Shadows},
                                                   {"Highlights", SliderScales::Highlights},
                                                   {"Temperature", SliderScales::Temperature}};
    block.setScale(scales.at(words[0]));
    block.setMinMax(words.at(1).toDouble(), words.at(2).toDouble());
}

void COrvelaSliderBlockImplTest::select() {
    block.txtValue->setFocus();
    block.txtValue->selectAll();
}

void COrvelaSliderBlockImplTest::click(QWidget* part, Qt::MouseButton button) {
    QTest::mouseClick(window.windowHandle(), button, {}, part->mapTo(&window, part->rect().center()));
}

void COrvelaSliderBlockImplTest::doubleClick(QWidget* part, Qt::MouseButton button) {
    QTest::mouseDClick(window.windowHandle(), button, {}, part->mapTo(&window, part->rect().center()));
}

// As the toolkit hands it on: to the part under the mouse and, while it is ignored, to what surrounds it.
void COrvelaSliderBlockImplTest::wheel(const QStringList& what) {
    const Qt::KeyboardModifiers keys = what.size() > 2 ? Qt::ControlModifier : Qt::NoModifier;
    for (QWidget* part = parts.at(what[0]); part; part = part->parentWidget()) {
        QWheelEvent event({3, 3}, part->mapToGlobal(QPointF(3, 3)), {}, {0, what.at(1).toInt()}, Qt::NoButton,
                          keys, Qt::NoScrollPhase, false);
        QCoreApplication::sendEvent(part, &event);
        if (event.isAccepted())
            return;
    }
}

// A move with another button held, which the slider gets without a drag.
void COrvelaSliderBlockImplTest::dragWithout(int x) {
    QMouseEvent move(QEvent::MouseMove, QPointF(x, 3), slider()->mapToGlobal(QPointF(x, 3)), Qt::NoButton,
                     kRight, {});
    QCoreApplication::sendEvent(slider(), &move);
}

void COrvelaSliderBlockImplTest::key(const QString& key) {
    const QKeyCombination combination = QKeySequence(key)[0];
    QTest::keyClick(QApplication::focusWidget(), combination.key(), combination.keyboardModifiers());
}

std::string COrvelaSliderBlockImplTest::state() const {
    const bool on = block.isEnabled();
    EXPECT_TRUE(slider()->isEnabledTo(&block) == on && block.txtValue->font().italic() != on);
    EXPECT_EQ(block.lmpState->isChecked(), on);
    EXPECT_TRUE(block.lblName->isEnabledTo(&block));
    EXPECT_EQ(slider()->hasMouseTracking(), slider()->isDragging());
    const auto focused =
        std::find_if(parts.begin(), parts.end(), [](const auto& part) { return part.second->hasFocus(); });
    QString position = QString::number(block.value());
    if (block.exactValue() != block.value())
        position += " for " + QString::number(block.exactValue());
    if (slider()->isDragging())
        position += " dragged";
    const QString focus = focused == parts.end() ? QStringLiteral("-") : focused->first;
    const QStringList words = {text(), position + (on ? "" : " off"), focus, told.join(' ')};
    return words.join(" | ").trimmed().toStdString();
}

class COrvelaSliderBlockImplTable : public COrvelaSliderBlockImplTest,
                                    public testing::WithParamInterface<QString> {};

TEST_P(COrvelaSliderBlockImplTable, TellsWhatItDoes) {
    QFile file(kTables + GetParam());
    ASSERT_TRUE(file.open(QIODevice::ReadOnly));
    for (const QString& line : QString::fromUtf8(file.readAll()).split('\n', Qt::SkipEmptyParts)) {
        if (line.startsWith('#'))
            continue;
        const QString action = line.section(" | ", 0, 0);
        told.clear();
        actions.at(action.section(' ', 0, 0))(action.section(' ', 1));
        EXPECT_EQ(state(), line.section(" | ", 1).toStdString()) << qPrintable(action);
    }
}

INSTANTIATE_TEST_SUITE_P(All, COrvelaSliderBlockImplTable,
                         testing::ValuesIn(QDir(kTables).entryList(QDir::Files)),
                         [](const auto& file) { return file.param.chopped(4).toStdString(); });

TEST_F(COrvelaSliderBlockImplTest, AKeyAlwaysMovesTheShownNumber) {
    using namespace SliderScales;
    for (const SliderScale* scale : {&Thousandth, &Gamma, &Highlights}) {
        block.setScale(*scale);
        for (const auto& [key, end] : {std::pair(Qt::Key_Left, 0.0), {Qt::Key_Right, 1000.0}}) {
            for (int count = 0; std::abs(block.value() - end) > 0.01 && count < 300; ++count) {
                const QString before = text();
                QTest::keyClick(slider(), key);
                EXPECT_NE(text(), before);
            }
            EXPECT_NEAR(block.value(), end, 0.01);
        }
    }
}

TEST_F(COrvelaSliderBlockImplTest, TellsAssistiveToolsNameRoleAndValue) {
    block.setScale(SliderScales::Temperature);
    block.setMinMax(2000, 10000);
    block.setHelp(QStringLiteral("Warmer or cooler."));
    block.setValue(500);
    QAccessibleInterface* access = QAccessible::queryAccessibleInterface(slider());
    ASSERT_TRUE(access && access->valueInterface());
    EXPECT_EQ(access->role(), QAccessible::Slider);
    EXPECT_EQ(access->text(QAccessible::Name), QStringLiteral("Fade"));
    EXPECT_EQ(access->text(QAccessible::Value), QStringLiteral("6000.0"));
    QAccessibleValueInterface* value = access->valueInterface();
    EXPECT_EQ(value->currentValue(), QVariant(6000.0));
    EXPECT_EQ(value->minimumValue(), QVariant(2000.0));
    EXPECT_EQ(value->maximumValue(), QVariant(10000.0));
    EXPECT_EQ(value->minimumStepSize(), QVariant(80.0));
    value->setCurrentValue(6080);
    EXPECT_EQ(block.value(), 510);
    value->setCurrentValue(1e9);
    EXPECT_EQ(text(), "10000.0");
    QAccessibleInterface* lamp = QAccessible::queryAccessibleInterface(block.lmpState);
    ASSERT_TRUE(lamp && lamp->actionInterface());
    EXPECT_EQ(lamp->role(), QAccessible::CheckBox);
    EXPECT_EQ(lamp->text(QAccessible::Name), QStringLiteral("Fade"));
    EXPECT_EQ(lamp->text(QAccessible::Description), QStringLiteral("Warmer or cooler."));
    EXPECT_TRUE(lamp->state().checkable && lamp->state().checked);
    lamp->actionInterface()->doAction(QAccessibleActionInterface::toggleAction());
    EXPECT_FALSE(lamp->state().checked || block.isEnabled());
    value->setCurrentValue(2000);
    EXPECT_EQ(block.value(), 1000) << "it is off";
    EXPECT_EQ(QAccessible::queryAccessibleInterface(&block)->role(), QAccessible::Grouping);
    EXPECT_EQ(QAccessible::queryAccessibleInterface(block.txtValue)->text(QAccessible::Name),
              QStringLiteral("Fade"));
}

// How far the brightest pixel of the slider's row is from the ground, 0 to 255.
int contrast(QWidget& window, const QWidget* slider) {
    const QImage image = painted(window);
    const int ground = qGray(image.pixel(1, 1));
    const QRect place(slider->mapTo(&window, QPoint(0, 0)), slider->size());
    int most = 0;
    for (int y = place.top(); y <= place.bottom(); ++y)
        for (int x = place.left() + 20; x <= place.right(); ++x)
            most = std::max(most, std::abs(qGray(image.pixel(x, y)) - ground));
    return most;
}

TEST_F(COrvelaSliderBlockImplTest, OffIsQuietestAndDisabledSurroundingsOnlyDim) {
    for (const QColor& ground : {QColor(53, 53, 53), QColor(239, 239, 239)}) {
        window.setPalette(QPalette(ground));
        block.setZoneStops({{0, QColor(255, 120, 0)}, {1000, QColor(255, 120, 0)}});
        block.setValue(0); // the handle stands apart, at the left
        window.setFocus();
        const int on = contrast(window, slider());
        window.setEnabled(false);
        const int dimmed = contrast(window, slider());
        window.setEnabled(true);
        block.setEnabled(false);
        const int off = contrast(window, slider());
        EXPECT_LT(off, dimmed);
        EXPECT_LT(dimmed, on);
        window.setEnabled(false);
        EXPECT_EQ(contrast(window, slider()), off) << "off looks as it did";
        window.setEnabled(true);
        block.setEnabled(true);
    }
}

TEST_F(COrvelaSliderBlockImplTest, TheFocusIsARingAroundTheSlider) {
    const auto ring = [this] { return painted(window).pixelColor(slider()->mapTo(&window, QPoint(50, -3))); };
    for (const QColor& ground : {QColor(53, 53, 53), QColor(239, 239, 239)}) {
        window.setPalette(QPalette(ground));
        next.sldrValue->setFocus();
        EXPECT_EQ(ring(), ground);
        slider()->setFocus();
        EXPECT_GT(std::abs(qGray(ring().rgb()) - qGray(ground.rgb())), 128);
    }
}

} // namespace
