// What a slider block does as a user works with it: data/slider_block/*.txt. A line is an action and what is
// so after it: the text, the position (dragged; off), where the focus is, and what the block told meanwhile.

#include "GUI/Controls/COrvelaSliderBlockImpl.h"

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
    void doubleClick(QWidget* part);
    void wheel(int angle);
    /// A pixel of the slider as a point of the row, above it.
    QPoint inRow(const QString& x) const { return {slider()->x() + x.toInt(), 1}; }
    std::string state() const;

    QStringList told;
    QWidget window;
    COrvelaSliderBlockImpl block{&window};
    COrvelaSliderBlockImpl next{&window};
    const std::map<QString, QWidget*> parts = {{"name", block.lblName},
                                               {"slider", slider()},
                                               {"text", block.txtValue},
                                               {"next slider", next.sldrValue},
                                               {"next text", next.txtValue}};
    using Text = const QString&;
    static constexpr Qt::MouseButton kLeft = Qt::LeftButton;
    const std::map<QString, std::function<void(Text)>> actions = {
        {"scale", [this](Text what) { setScale(what); }},
        {"set", [this](Text position) { block.setValue(position.toDouble()); }},
        {"show", [this](Text number) { block.setVirtualValue(number.toDouble()); }},
        {"switch", [this](Text to) { block.setEnabled(to == "on"); }},
        {"window", [this](Text to) { window.setEnabled(to == "on"); }},
        {"focus", [this](Text part) { parts.at(part)->setFocus(); }},
        {"key",
         [](Text key) { QTest::keyClick(QApplication::focusWidget(), Qt::Key(QKeySequence(key)[0].key())); }},
        {"type", [this](Text keys) { select(), QTest::keyClicks(block.txtValue, keys); }},
        {"paste",
         [this](Text text) { select(), QApplication::clipboard()->setText(text), block.txtValue->paste(); }},
        {"tip", [this](Text) { told << QToolTip::text(); }},
        {"double", [this](Text part) { doubleClick(parts.at(part)); }},
        {"wheel", [this](Text angle) { wheel(angle.toInt()); }},
        {"press", [this](Text x) { QTest::mousePress(slider(), kLeft, {}, QPoint(x.toInt(), 3)); }},
        {"move", [this](Text x) { QTest::mouseMove(slider(), QPoint(x.toInt(), 3)); }},
        {"release", [this](Text x) { QTest::mouseRelease(slider(), kLeft, {}, QPoint(x.toInt(), 3)); }},
        {"row-press", [this](Text x) { QTest::mousePress(&block, kLeft, {}, inRow(x)); }},
        {"row-move", [this](Text x) { QTest::mouseMove(&block, inRow(x)); }},
        {"row-release", [this](Text x) { QTest::mouseRelease(&block, kLeft, {}, inRow(x)); }}};
};

void COrvelaSliderBlockImplTest::setScale(const QString& what) {
    const QStringList words = what.split(' ');
    block.setScale(words[0] == "Shadows" ? SliderScales::Shadows : SliderScales::Temperature);
    block.setMinMax(words.at(1).toDouble(), words.at(2).toDouble());
}

void COrvelaSliderBlockImplTest::select() {
    block.txtValue->setFocus();
    block.txtValue->selectAll();
}

void COrvelaSliderBlockImplTest::doubleClick(QWidget* part) {
    const QPoint point = part->mapTo(&window, part->rect().center());
    QTest::mouseDClick(window.windowHandle(), Qt::LeftButton, {}, point);
}

void COrvelaSliderBlockImplTest::wheel(int angle) {
    QWheelEvent event({50, 3}, slider()->mapToGlobal(QPointF(50, 3)), {}, {0, angle}, Qt::NoButton, {},
                      Qt::NoScrollPhase, false);
    QCoreApplication::sendEvent(slider(), &event);
}

std::string COrvelaSliderBlockImplTest::state() const {
    const bool on = block.isEnabled();
    EXPECT_TRUE(slider()->isEnabledTo(&block) == on && block.txtValue->font().italic() != on);
    EXPECT_TRUE(block.lblName->isEnabledTo(&block));
    EXPECT_EQ(slider()->hasMouseTracking(), slider()->isDragging());
    const auto focused =
        std::find_if(parts.begin(), parts.end(), [](const auto& part) { return part.second->hasFocus(); });
    const QString position = QString::number(block.value()) + (slider()->isDragging() ? " dragged" : "");
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
    block.setValue(250);
    QAccessibleInterface* access = QAccessible::queryAccessibleInterface(slider());
    ASSERT_TRUE(access && access->valueInterface());
    EXPECT_EQ(access->role(), QAccessible::Slider);
    EXPECT_EQ(access->text(QAccessible::Name), QStringLiteral("Fade"));
    EXPECT_EQ(access->text(QAccessible::Value), QStringLiteral("25.0"));
    access->valueInterface()->setCurrentValue(2000);
    EXPECT_EQ(text(), "100.0");
    block.setEnabled(false);
    access->valueInterface()->setCurrentValue(500);
    EXPECT_EQ(block.value(), 1000);
    EXPECT_EQ(QAccessible::queryAccessibleInterface(&block)->role(), QAccessible::Grouping);
    EXPECT_EQ(QAccessible::queryAccessibleInterface(block.txtValue)->text(QAccessible::Name),
              QStringLiteral("Fade"));
}

} // namespace
