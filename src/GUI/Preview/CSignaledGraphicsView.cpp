#include "GUI/Preview/CSignaledGraphicsView.h"

#include <QScrollBar>
#include <QWheelEvent>

CSignaledGraphicsView::CSignaledGraphicsView(QWidget* parent) : CSignaledGraphicsView(nullptr, parent) {}

CSignaledGraphicsView::CSignaledGraphicsView(QGraphicsScene* scene, QWidget* parent) : QGraphicsView(parent) {
    setAccessibleName(tr("Preview"));
    setScene(scene);
}

void CSignaledGraphicsView::mouseMoveEvent(QMouseEvent* event) {
    QGraphicsView::mouseMoveEvent(event);
    tellScroll();
}

void CSignaledGraphicsView::keyPressEvent(QKeyEvent* event) {
    QGraphicsView::keyPressEvent(event);
    tellScroll();
}

void CSignaledGraphicsView::wheelEvent(QWheelEvent* event) {
    mWheelRest += event->angleDelta().y();
    const int notches = mWheelRest / QWheelEvent::DefaultDeltasPerStep;
    mWheelRest -= notches * QWheelEvent::DefaultDeltasPerStep;
    if (notches != 0)
        Q_EMIT zoomRequested(notches, event->position().toPoint());
    event->accept();
}

// The base view stays out: whoever hears the signal fits the picture anew.
void CSignaledGraphicsView::resizeEvent(QResizeEvent*) {
    Q_EMIT sizeChanged(geometry());
}

void CSignaledGraphicsView::tellScroll() {
    Q_EMIT scrolledBy(horizontalScrollBar()->value(), verticalScrollBar()->value());
}
