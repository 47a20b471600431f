#include "GUI/Windows/CDlgSinglePreviewImpl.h"

CDlgSinglePreviewImpl::CDlgSinglePreviewImpl(QWidget* parent) : PreviewWindow(parent) {
    setupUi(this);
}
