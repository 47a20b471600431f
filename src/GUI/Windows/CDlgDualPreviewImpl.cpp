#include "GUI/Windows/CDlgDualPreviewImpl.h"

#include <QCloseEvent>

CDlgDualPreviewImpl::CDlgDualPreviewImpl(QWidget* parent) : QDialog(parent) {
    setupUi(this);
}

void CDlgDualPreviewImpl::addView(QWidget* view) {
    hboxLayout->addWidget(view);
}

void CDlgDualPreviewImpl::addBelow(QWidget* widget) {
    vboxLayout->addWidget(widget);
}

void CDlgDualPreviewImpl::closeEvent(QCloseEvent* event) {
    event->ignore();
}
