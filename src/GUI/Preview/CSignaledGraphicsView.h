#pragma once

#include <QGraphicsView>

/// A view of a preview that tells where it was moved to and what size it got, so that a second view can
/// follow, and what the wheel asks for.
class CSignaledGraphicsView : public QGraphicsView {
    Q_OBJECT

public:
    explicit CSignaledGraphicsView(QWidget* parent = nullptr);
    explicit CSignaledGraphicsView(QGraphicsScene* scene, QWidget* parent = nullptr);

Q_SIGNALS:
    /// The mouse moved, or a key scrolled. Both arguments are absolute values of the scroll bars.
    void scrolledBy(int dX, int dY);
    void sizeChanged(QRect newGeometry);
    /// The wheel was turned by so many notches, away from the user counting up, over that point of the
    /// viewport.
    void zoomRequested(int notches, QPoint at);

protected:
    void mouseMoveEvent(QMouseEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    void tellScroll();

    int mWheelRest = 0; ///< eighths of a degree that make no whole notch yet
};
