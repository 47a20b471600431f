#pragma once

#include <QGraphicsView>

/// A view of a preview that tells where it was dragged to and what size it got, so that a second view can
/// follow.
class CSignaledGraphicsView : public QGraphicsView {
    Q_OBJECT

public:
    explicit CSignaledGraphicsView(QWidget* parent = nullptr);
    explicit CSignaledGraphicsView(QGraphicsScene* scene, QWidget* parent = nullptr);

Q_SIGNALS:
    /// The mouse moved. Both arguments are absolute values of the scroll bars.
    void scrolledBy(int dX, int dY);
    void sizeChanged(QRect newGeometry);

protected:
    void mouseMoveEvent(QMouseEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
};
