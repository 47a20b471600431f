#include "GUI/Controls/CSignaledGraphicsView.h"

#include <QScrollBar>

CSignaledGraphicsView::CSignaledGraphicsView(QWidget* parent) : CSignaledGraphicsView(nullptr, parent) {}

CSignaledGraphicsView::CSignaledGraphicsView(QGraphicsScene* scene, QWidget* parent) : QGraphicsView(parent) {
    setAccessibleName(tr("Preview"));
    setScene(scene);
}

void CSignaledGraphicsView::mouseMoveEvent(QMouseEvent* event) {
    QGraphicsView::mouseMoveEvent(event);
    Q_EMIT scrolledBy(horizontalScrollBar()->value(), verticalScrollBar()->value());
}

// The base view stays out: whoever hears the signal fits the picture anew.
void CSignaledGraphicsView::resizeEvent(QResizeEvent*) {
    Q_EMIT sizeChanged(geometry());
}
