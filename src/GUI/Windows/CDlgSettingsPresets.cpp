// The preset list of the processing window and its buttons.
#include "GUI/Panes/IWgtPane.h"
#include "GUI/Presets/CPresetStore.h"
#include "GUI/Windows/CDlgSettingsImpl.h"
#include "Settings/PresetTree.h"
#include "Settings/SettingsStore.h"
#include "Utility/DebugBoxes.h"

#include <QInputDialog>
#include <QMessageBox>

using namespace orvela;

namespace {

struct EntryIcon {
    const char* preset;
    const char* icon;
};

constexpr char kUserIcon[] = ":/Mode_Advanced.png";
constexpr EntryIcon kFactoryIcons[] = {
    {"Automatic", ":/Mode_Automatic.png"}, {"AutomaticPro", ":/Mode_AutomaticPro.png"},
    {"Portrait", ":/Mode_Portrait.png"},   {"PortraitPro", ":/Mode_PortraitPro.png"},
    {"Landscape", ":/Mode_Landscape.png"}, {"LandscapePro", ":/Mode_LandscapePro.png"},
    {"Macro", ":/Mode_Macro.png"},         {"MacroPro", ":/Mode_MacroPro.png"},
    {"AutoLevels", ":/Mode_Macro.png"},    {"AutoContrast", ":/Mode_Macro.png"},
    {"AutoColor", ":/Mode_Macro.png"},     {"AutoSaturation", ":/Mode_Macro.png"},
};

} // namespace

void CDlgSettingsImpl::fillPresets() {
    const QSignalBlocker quiet(lstBxPreset); // nothing is chosen yet
    for (int last = lstBxPreset->count() - 1; last >= 0; --last)
        lstBxPreset->removeItem(last);
    mPane->fillPresetList(lstBxPreset);
    for (const QString& name : CPresetStore::listPresets(mMode, true))
        lstBxPreset->addItem(QIcon(QLatin1String(kUserIcon)), name);
    for (const EntryIcon& entry : kFactoryIcons) {
        const int index =
            lstBxPreset->findText(QLatin1String(entry.preset), Qt::MatchExactly | Qt::MatchCaseSensitive);
        if (index >= 0)
            lstBxPreset->setItemIcon(index, QIcon(QLatin1String(entry.icon)));
    }
}

QString CDlgSettingsImpl::selectedPresetKey() {
    return PresetTree::guiKey(QStringLiteral("CDlgSettingsImpl/selectedPreset"));
}

void CDlgSettingsImpl::selectPreset(const QString& name) {
    int index = lstBxPreset->findText(name, Qt::MatchExactly | Qt::MatchCaseSensitive);
    if (index < 0)
        index = lstBxPreset->findText(QStringLiteral("Automatic"), Qt::MatchExactly | Qt::MatchCaseSensitive);
    lstBxPreset->setCurrentIndex(index);
}

void CDlgSettingsImpl::selectStoredPreset() {
    selectPreset(openSettings().value(selectedPresetKey(), QStringLiteral("Automatic")).toString());
}

void CDlgSettingsImpl::on_lstBxPreset_currentIndexChanged(const QString& name) {
    if (!mPane)
        return;
    together(tr("preset %1").arg(name), [&] {
        if (CPresetStore::isFactoryPresetName(name))
            mPane->setSliders(lstBxPreset->currentText());
        CPresetStore::loadPreset(mPane, mMode, name);
    });
}

bool CDlgSettingsImpl::savePresetAs(const QString& name, bool asks, bool& isNew) {
    bool saved = false;
    CPresetStore::savePreset(mPane, mMode, name, saved, isNew, asks);
    return saved;
}

void CDlgSettingsImpl::on_btnSavePreset_clicked() {
    bool accepted = false;
    const QString name =
        QInputDialog::getText(this, tr("Save Preset"), tr("Enter a name for the preset to be saved as."),
                              QLineEdit::Normal, lstBxPreset->currentText(), &accepted);
    if (!accepted)
        return;
    if (name == CPresetStore::batchPresetName()) {
        QMessageBox::warning(this, tr("Warning"),
                             tr("This name is kept for the last operation. Choose another one."));
        return;
    }
    bool isNew = false;
    if (!savePresetAs(name, true, isNew))
        return;
    if (isNew)
        lstBxPreset->addItem(QIcon(QLatin1String(kUserIcon)), name);
    lstBxPreset->setCurrentIndex(lstBxPreset->findText(name, Qt::MatchExactly | Qt::MatchCaseSensitive));
}

void CDlgSettingsImpl::on_btnDeletePreset_clicked() {
    const QString name = lstBxPreset->currentText();
    if (CPresetStore::isFactoryPresetName(name)) {
        QMessageBox::warning(
            this, tr("Warning"),
            tr("The current preset cannot be deleted, since it's one of the factory presets."));
        return;
    }
    if (lstBxPreset->currentIndex() < 0 ||
        QMessageBox::question(this, tr("Deleting Preset"),
                              tr("Are you sure you want to delete the selected preset?"),
                              QMessageBox::Yes | QMessageBox::No) != QMessageBox::Yes)
        return;
    if (CPresetStore::removePreset(mMode, name))
        lstBxPreset->removeItem(lstBxPreset->currentIndex());
}

void CDlgSettingsImpl::on_btnRevertPreset_clicked() {
    if (QMessageBox::question(
            this, tr("Warning"),
            tr("By reverting the profile, you will\nloose the changes you have made. Proceed?"),
            QMessageBox::Yes | QMessageBox::No) != QMessageBox::Yes)
        return;
    const QString name = lstBxPreset->currentText();
    const QString what = tr("reverting %1").arg(name);
    if (!CPresetStore::isFactoryPresetName(name))
        return together(what, [&] { CPresetStore::loadPreset(mPane, mMode, name); });
    together(what, [&] { mPane->setSliders(name); });
    bool isNew = false;
    if (!savePresetAs(name, false, isNew))
        DebugBoxes::debugWarning(QStringLiteral("Success failed."), QStringLiteral("Debug Warning"));
}
