#include "GUI/Windows/CDlgCustomPresetImpl.h"

#include "GUI/Controls/Artwork.h"
#include "GUI/Presets/CPresetStore.h"
#include "GUI/Windows/WindowSetup.h"
#include "Utility/CGenericEx.h"

#include <QMessageBox>
#include <QPointer>

using namespace orvela;

CDlgCustomPresetImpl::CDlgCustomPresetImpl(QWidget* parent, HelpOpener openHelpPage)
    : QDialog(parent, Qt::Tool | Qt::WindowStaysOnTopHint), mOpenHelpPage(std::move(openHelpPage)) {
    initArtwork();
    setupUi(this);
    flatten({btnHelp, btnOK, btnCancel});
    fillList();
    restorePosition(*this);
}

QString CDlgCustomPresetImpl::choose(QWidget* parent, const HelpOpener& openHelpPage) {
    if (!CPresetStore::hasPresets())
        throw CGenericEx(tr("There are no custom preset to load."), "CDlgCustomPresetImpl.cpp", __LINE__);
    const QPointer<CDlgCustomPresetImpl> dialog = new CDlgCustomPresetImpl(parent, openHelpPage);
    QString text = dialog->exec() == Accepted ? dialog->chosenText() : QString();
    if (dialog) // its parent may have gone, and it with it
        dialog->deleteLater();
    return text;
}

void CDlgCustomPresetImpl::fillList() {
    const QIcon icon(QStringLiteral(":/Mode_Advanced.png"));
    for (const QString& name : CPresetStore::listPresets(Mode_Advanced, true))
        lstBxPreset->addItem(icon, name);
    if (lstBxPreset->count() == 0)
        QMessageBox::information(
            parentWidget(), tr("Information"),
            tr("You don't have any profiles yet. You can create and save profiles in the "
               "Advanced mode window."));
}

void CDlgCustomPresetImpl::on_btnOK_clicked() {
    if (lstBxPreset->currentIndex() < 0)
        return reject();
    mChosenIndex = lstBxPreset->currentIndex();
    mChosenText = lstBxPreset->currentText();
    accept();
}

void CDlgCustomPresetImpl::on_btnCancel_clicked() {
    reject();
}

void CDlgCustomPresetImpl::on_btnHelp_clicked() {
    if (mOpenHelpPage)
        mOpenHelpPage(QStringLiteral("presetandcustomfilters.htm"));
}

void CDlgCustomPresetImpl::done(int result) {
    storePosition(*this);
    QDialog::done(result);
}
