#pragma once

#include <QImage>
#include <QWidget>

namespace orvela {

/// What the control looks like.
inline QImage painted(QWidget& widget) {
    QImage image(widget.size(), QImage::Format_RGB32);
    widget.render(&image);
    return image;
}

} // namespace orvela
