#include "GUI/Controls/CColorPicker.h"
#include "GUI/Controls/CColorPickerPopup.h"
#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Controls/COrvelaStatusIndicator.h"
#include "GUI/Preview/CSignaledGraphicsView.h"
#include "GUI/Preview/PreviewScene.h"
#include "Shots.h"
#include "Utility/CARGBPlane.h"

#include <QDirIterator>
#include <QGraphicsScene>
#include <QGridLayout>
#include <QLabel>
#include <QToolButton>

using namespace orvela;

namespace {

using Widget = std::unique_ptr<QWidget>;

COrvelaSliderBlockImpl* addBlock(QWidget* parent, const char* name, const SliderScale& scale, double position,
                                 bool on) {
    auto* block = new COrvelaSliderBlockImpl(parent);
    block->setText(QString::fromUtf8(name));
    block->setScale(scale);
    block->setZoneStops({{0, QColor(0, 255, 40)},
                         {599, QColor(0, 255, 40)},
                         {600, QColor(255, 120, 0)},
                         {899, QColor(255, 120, 0)},
                         {900, QColor(255, 40, 0)},
                         {1000, QColor(255, 40, 0)}});
    block->setValue(position);
    block->setEnabled(on);
    parent->layout()->addWidget(block);
    return block;
}

Widget sliderBlocks() {
    auto frame = std::make_unique<QWidget>();
    new QVBoxLayout(frame.get());
    QWidget* parent = frame.get();
    addBlock(parent, "Contrast", SliderScales::Tenth, 0, true);
    addBlock(parent, "Digital Flash", SliderScales::Tenth, 350, true);
    addBlock(parent, "Sharpness II", SliderScales::Sharpness, 750, true);
    addBlock(parent, "Temperature", SliderScales::Temperature, 1000, true);
    addBlock(parent, "Highlights", SliderScales::Highlights, 500, false);
    addBlock(parent, "B&W Spots", SliderScales::Spots, 0, false);
    addBlock(parent, "With focus", SliderScales::Brightness, 400, true)->sldrValue->setFocus();
    frame->resize(320, frame->sizeHint().height());
    return frame;
}

Widget colorPickers() {
    auto frame = std::make_unique<QWidget>();
    auto* layout = new QVBoxLayout(frame.get());
    for (const QColor& color :
         {QColor(255, 255, 255), QColor(0, 255, 0), QColor(10, 20, 90), QColor(200, 128, 0)}) {
        auto* picker = new CColorPicker(frame.get());
        picker->setColor(color);
        layout->addWidget(picker);
    }
    return frame;
}

Widget colorField() {
    auto field = std::make_unique<CColorPickerPopup>();
    field->open({}, QColor(200, 128, 0), {});
    return field;
}

Widget statusIndicators() {
    auto frame = std::make_unique<QWidget>();
    auto* layout = new QVBoxLayout(frame.get());
    for (int step : {0, 1, 3, 4}) {
        auto* indicator = new COrvelaStatusIndicator(frame.get());
        indicator->setStep(step, 4);
        indicator->setPercentage(step * 30);
        layout->addWidget(indicator);
    }
    frame->resize(320, frame->sizeHint().height());
    return frame;
}

Widget preview(const CARGBPlane& plane) {
    auto view = std::make_unique<CSignaledGraphicsView>();
    auto* scene = new QGraphicsScene(view.get());
    PreviewScene::show(*scene, plane);
    view->setScene(scene);
    view->setBackgroundBrush(Qt::black);
    view->resize(260, 180);
    return view;
}

Widget icons() {
    auto frame = std::make_unique<QWidget>();
    auto* layout = new QGridLayout(frame.get());
    QStringList paths;
    QDirIterator found(QStringLiteral(":/"), {QStringLiteral("*.png")}, QDir::Files,
                       QDirIterator::Subdirectories);
    while (found.hasNext())
        paths.append(found.next());
    const auto isNoIcon = [](const QString& path) { // the toolkit's own, or too large
        return path.contains(QLatin1Char('@')) || path.startsWith(QLatin1String(":/qt-project.org")) ||
               QImage(path).width() > 24;
    };
    paths.removeIf(isNoIcon);
    paths.sort();
    for (int index = 0; index < paths.size(); ++index) {
        auto* button = new QToolButton(frame.get());
        button->setIcon(QIcon(paths[index]));
        button->setIconSize(QImage(paths[index]).size());
        button->setEnabled(index < paths.size() - 2); // the last two show what disabled looks like
        layout->addWidget(button, index / 10, index % 10);
    }
    return frame;
}

Widget logo() {
    auto label = std::make_unique<QLabel>();
    label->setPixmap(QPixmap(QStringLiteral(":/Logo_EyeBig.png")));
    return label;
}

// Hues along the columns, darker towards the foot.
void fill(CARGBPlane& plane) {
    plane.setColorMode(CARGBPlane::Color);
    for (int y = 0; y < plane.height(); ++y) {
        for (int x = 0; x < plane.width(); ++x) {
            const QColor color =
                QColor::fromHsv(x * 359 / plane.width(), 160, 255 - y * 200 / plane.height());
            plane.row(y)[0][x] = static_cast<std::uint8_t>(color.red());
            plane.row(y)[1][x] = static_cast<std::uint8_t>(color.green());
            plane.row(y)[2][x] = static_cast<std::uint8_t>(color.blue());
        }
    }
}

} // namespace

std::vector<Shot> controlShots(CARGBPlane& plane) {
    fill(plane);
    std::vector<Shot> shots;
    shots.emplace_back("slider-blocks", sliderBlocks());
    shots.emplace_back("color-pickers", colorPickers());
    shots.emplace_back("color-field", colorField());
    shots.emplace_back("status-indicators", statusIndicators());
    shots.emplace_back("preview", preview(plane));
    shots.emplace_back("icons", icons());
    shots.emplace_back("logo", logo());
    return shots;
}
