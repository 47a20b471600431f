#include "GUI/Windows/CDlgProgramInfosImpl.h"

#include "GUI/Controls/Artwork.h"
#include "Update/RunningVersion.h"

CDlgProgramInfosImpl::CDlgProgramInfosImpl(QWidget* parent)
    : QDialog(parent, Qt::Tool | Qt::WindowStaysOnTopHint) {
    orvela::initArtwork();
    setupUi(this);
    lblContent->setText(lblContent->text().arg(orvela::kRunningVersion, 0, 'f', 2));
}
