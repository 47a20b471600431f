// The keys of the processing window, which its previews have too.
#include "GUI/Controls/KeyTips.h"
#include "GUI/Panes/IWgtPane.h"
#include "GUI/Windows/CDlgSettingsImpl.h"
#include "GUI/Windows/PaneHistory.h"
#include "GUI/Windows/Previews.h"

#include <QAction>

using namespace orvela;

namespace {

// Keys, the first of which is told, and the buttons that they press: whichever of them is there.
struct ButtonKeys {
    const char* keys;
    std::initializer_list<const char*> buttons;
};

const ButtonKeys kButtonKeys[] = {
    {"F5", {"btnRefresh"}},
    {"Shift+F5", {"chkBxAutoRefresh"}},
    {"Ctrl+.", {"btnStopProcessing"}},
    {"Ctrl++; Ctrl+=", {"btnZoomIn"}},
    {"Ctrl+-", {"btnZoomOut"}},
    {"F4", {"btnSplitPreviews", "btnGluePreviews"}},
    {"Ctrl+E", {"btnTurnAllOn"}},
    {"Ctrl+Shift+E", {"btnTurnAllOff"}},
    {"Ctrl+R", {"btnRevertPreset"}},
    {"Ctrl+S", {"btnSavePreset"}},
    {"Ctrl+D", {"btnDeletePreset"}},
    {"F6", {"btnFinalTouch", "btnBack"}},
    {"F7", {"btnExtendSettings", "btnCollapseSettings"}},
    {"F1", {"btnHelp"}},
    {"Ctrl+Return; Ctrl+Enter", {"btnOK"}},
};

void press(const QWidget* window, const ButtonKeys& keys) {
    for (const char* name : keys.buttons) {
        auto* button = window->findChild<QAbstractButton*>(QLatin1String(name));
        if (button && button->isVisible() && button->isEnabled())
            return button->click();
    }
}

} // namespace

void CDlgSettingsImpl::addKeys() {
    for (const ButtonKeys& keys : kButtonKeys) {
        auto* action = new QAction(this);
        action->setShortcuts(QKeySequence::listFromString(QLatin1String(keys.keys)));
        connect(action, &QAction::triggered, this, [this, &keys] { press(this, keys); });
        addAction(action);
    }
    addActions({mHistory->undoAction(), mHistory->redoAction()});
    btnUndo->setDefaultAction(mHistory->undoAction());
    btnRedo->setDefaultAction(mHistory->redoAction());
    showKeys(this);
    btnCancel->setToolTip(withKeys(btnCancel->toolTip(), {Qt::Key_Escape}));
}

// A key works where the eye is: in the windows of the previews as in this one.
void CDlgSettingsImpl::addKeysToPreviews() {
    addActions(mPreviews->keys());
    auto* cancel = new QAction(mPreviews.get()); // this window is a dialog and has that key
    cancel->setShortcut(Qt::Key_Escape);
    connect(cancel, &QAction::triggered, this, &CDlgSettingsImpl::on_btnCancel_clicked);
    for (QWidget* window : mPreviews->windows()) {
        window->addActions(actions());
        window->addAction(cancel);
        acceptDropsOn(window);
    }
}

void CDlgSettingsImpl::showKeys(const QWidget* root) {
    for (const ButtonKeys& keys : kButtonKeys)
        for (const char* name : keys.buttons)
            if (auto* button = root->findChild<QAbstractButton*>(QLatin1String(name)))
                button->setToolTip(withKeys(button->toolTip().isEmpty() ? button->text() : button->toolTip(),
                                            QKeySequence::listFromString(QLatin1String(keys.keys))));
}
