#include "GUI/Windows/CDlgAboutImpl.h"

#include "GUI/Controls/Artwork.h"
#include "Update/RunningVersion.h"

CDlgAboutImpl::CDlgAboutImpl(QWidget* parent) : QDialog(parent, Qt::Tool | Qt::WindowStaysOnTopHint) {
    orvela::initArtwork();
    setupUi(this);
    setWindowTitle(tr("Kestrand Orvela %1").arg(orvela::kRunningVersion, 0, 'f', 2));
    lblTitle->setText(windowTitle());
}
