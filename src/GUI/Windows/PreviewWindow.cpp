#include "GUI/Windows/PreviewWindow.h"

#include "GUI/Controls/Artwork.h"

#include <QCloseEvent>

namespace orvela {

namespace {

// A dialog's, so that it stays above its owner, but one that can fill the screen.
constexpr Qt::WindowFlags kFlags = Qt::Dialog | Qt::WindowTitleHint | Qt::WindowSystemMenuHint |
                                   Qt::WindowMaximizeButtonHint | Qt::WindowCloseButtonHint;

} // namespace

PreviewWindow::PreviewWindow(QWidget* owner) : QWidget(owner, kFlags) {
    initArtwork();
}

void PreviewWindow::closeEvent(QCloseEvent* event) {
    event->ignore();
}

} // namespace orvela
