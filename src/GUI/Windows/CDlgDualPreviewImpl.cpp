#include "GUI/Windows/CDlgDualPreviewImpl.h"

CDlgDualPreviewImpl::CDlgDualPreviewImpl(QWidget* parent) : PreviewWindow(parent) {
    setupUi(this);
}
