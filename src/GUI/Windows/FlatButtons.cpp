#include "GUI/Windows/FlatButtons.h"

#include <QToolButton>

namespace orvela {

void flattenButtons(QWidget& window) {
    QPalette flat = window.palette();
    const QBrush ground = flat.brush(QPalette::Window);
    for (const QPalette::ColorRole role :
         {QPalette::Light, QPalette::Midlight, QPalette::Dark, QPalette::Mid, QPalette::Shadow})
        flat.setBrush(role, ground);
    for (QToolButton* button : window.findChildren<QToolButton*>())
        button->setPalette(flat);
}

} // namespace orvela
