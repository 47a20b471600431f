#include "GUI/Controls/CColorPicker.h"
#include "GUI/Panes/CWgtPane3SlidersImpl.h"
#include "GUI/Panes/CWgtPaneAdvancedImpl.h"
#include "GUI/Panes/CWgtPaneFinalTouchImpl.h"
#include "GUI/Panes/CWgtPaneGenericImpl.h"
#include "Shots.h"

using namespace orvela;

namespace {

template <class P>
std::pair<std::unique_ptr<QWidget>, P*> framed(EGUIMode mode) {
    auto frame = std::make_unique<QWidget>();
    auto* pane = new P(frame.get(), mode);
    auto* layout = new QVBoxLayout(frame.get());
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(pane);
    return {std::move(frame), pane};
}

std::unique_ptr<QWidget> advanced(bool extended, int tab) {
    auto [frame, pane] = framed<CWgtPaneAdvancedImpl>(Mode_Advanced);
    pane->setSliders(QStringLiteral("PortraitPro"));
    if (extended)
        pane->on_btnExtendSettings_clicked();
    pane->tabCtnrSmartFilter->setCurrentIndex(tab);
    pane->sldrColorFilter->setEnabled(tab == 1);
    pane->sldrTemperature->setEnabled(true);
    pane->sldrTemperature->setValue(1000);
    pane->colrPickAutoColor->setColor(QColor(240, 160, 60));
    pane->wgtSettings->layout()->activate();
    const int hidden = pane->wgtSettings->sizeHint().height() - pane->scrSettings->sizeHint().height();
    frame->resize(frame->sizeHint() + QSize(0, hidden)); // the screen of the offscreen platform is low
    return std::move(frame);
}

std::unique_ptr<QWidget> running() {
    auto shown = advanced(false, 1);
    shown->setEnabled(false);
    return shown;
}

std::unique_ptr<QWidget> finalTouch(int tab, int channel) {
    auto [frame, pane] = framed<CWgtPaneFinalTouchImpl>(Mode_FinalTouch);
    pane->tabCtnrFinalTouch->setCurrentIndex(tab);
    (tab == 0 ? pane->tabCtnrPercRGB : pane->tabCtnrAbsRGB)->setCurrentIndex(channel);
    for (COrvelaSliderBlockImpl* block : pane->findChildren<COrvelaSliderBlockImpl*>())
        block->setEnabled(channel >= 2);
    pane->sldrPercMiddleRGB->setValue(330);
    pane->sldrPercBrightness->setValue(800);
    pane->colrPickPercColorFilter->setColor(QColor(40, 90, 220));
    return std::move(frame);
}

std::unique_ptr<QWidget> threeSliders(EGUIMode mode) {
    auto [frame, pane] = framed<CWgtPane3SlidersImpl>(mode);
    pane->sldr1->setEnabled(true);
    return std::move(frame);
}

std::unique_ptr<QWidget> generic(EGUIMode mode, double position) {
    auto [frame, pane] = framed<CWgtPaneGenericImpl>(mode);
    pane->sldrGeneric->setValue(position);
    return std::move(frame);
}

} // namespace

std::vector<Shot> paneShots() {
    std::vector<Shot> shots;
    shots.emplace_back("advanced-collapsed", advanced(false, 0));
    shots.emplace_back("advanced-running", running());
    shots.emplace_back("advanced-perceptual", advanced(true, 0));
    shots.emplace_back("advanced-absolute", advanced(true, 1));
    shots.emplace_back("final-touch-perceptual-red", finalTouch(0, 0));
    shots.emplace_back("final-touch-perceptual-all", finalTouch(0, 3));
    shots.emplace_back("final-touch-absolute-green", finalTouch(1, 1));
    shots.emplace_back("final-touch-absolute-blue", finalTouch(1, 2));
    shots.emplace_back("adjustments", threeSliders(Mode_Adjustments));
    shots.emplace_back("smart-levels", threeSliders(Mode_SmartLevels));
    shots.emplace_back("digital-flash", generic(Mode_AddDigitalFlash, 850));
    shots.emplace_back("color-filter", generic(Mode_ColorFilter, 400));
    return shots;
}
