#include "GUI/Controls/CSettingsArea.h"

#include <QEvent>
#include <QScreen>
#include <QScrollBar>

#include <algorithm>

namespace {

constexpr int kRestOfWindow = 250; // pixels, at most, of the windows that it stands in
constexpr int kLeastHeight = 160;

} // namespace

CSettingsArea::CSettingsArea(QWidget* parent) : QScrollArea(parent) {
    setWidgetResizable(true);
    setFrameShape(QFrame::NoFrame);
    setFocusPolicy(Qt::NoFocus);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
}

QSize CSettingsArea::sizeHint() const {
    const QSize content = widget() ? widget()->sizeHint() : QSize();
    const int room = std::max(kLeastHeight, screen()->availableGeometry().height() - kRestOfWindow);
    return {content.width() + verticalScrollBar()->sizeHint().width(), std::min(content.height(), room)};
}

QSize CSettingsArea::minimumSizeHint() const {
    const QSize content = widget() ? widget()->minimumSizeHint() : QSize();
    return {content.width() + verticalScrollBar()->sizeHint().width(),
            std::min(content.height(), kLeastHeight)};
}

bool CSettingsArea::event(QEvent* event) {
    if (event->type() == QEvent::LayoutRequest)
        updateGeometry(); // the content may have another height now
    return QScrollArea::event(event);
}
