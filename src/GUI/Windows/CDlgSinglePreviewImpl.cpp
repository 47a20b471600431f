#include "GUI/Windows/CDlgSinglePreviewImpl.h"

#include <QCloseEvent>

CDlgSinglePreviewImpl::CDlgSinglePreviewImpl(QWidget* parent) : QDialog(parent) {
    setupUi(this);
}

void CDlgSinglePreviewImpl::addView(QWidget* view) {
    hboxLayout->addWidget(view);
}

void CDlgSinglePreviewImpl::addBelow(QWidget* widget) {
    vboxLayout->addWidget(widget);
}

void CDlgSinglePreviewImpl::closeEvent(QCloseEvent* event) {
    event->ignore();
}
