// What the user does to the pane of the processing window: changes, undoing them, presets that are dropped.
#include "GUI/Controls/CColorPicker.h"
#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Controls/CThinHorizontalSlider.h"
#include "GUI/Panes/IWgtPane.h"
#include "GUI/Presets/CPresetStore.h"
#include "GUI/Presets/PresetDrop.h"
#include "GUI/Windows/CDlgSettingsImpl.h"
#include "GUI/Windows/PaneHistory.h"
#include "Settings/PresetFile.h"

#include <QAction>
#include <QApplication>
#include <QDropEvent>
#include <QFileInfo>
#include <QLineEdit>
#include <QMessageBox>
#include <QMimeData>
#include <QScopedValueRollback>

using namespace orvela;

void CDlgSettingsImpl::preparePane() {
    for (const auto* block : mPane->findChildren<COrvelaSliderBlockImpl*>()) {
        connect(block, &COrvelaSliderBlockImpl::valueChanged, this,
                &CDlgSettingsImpl::onMy_slider_valueChanged);
        connect(block, &COrvelaSliderBlockImpl::stateChanged, this,
                &CDlgSettingsImpl::onMy_slider_stateChanged);
    }
    for (const auto* picker : mPane->findChildren<CColorPicker*>())
        connect(picker, &CColorPicker::colorChanged, this, &CDlgSettingsImpl::onMy_colorPicker_colorChanged);
    for (const auto* slider : mPane->findChildren<CThinHorizontalSlider*>())
        connect(slider, &CThinHorizontalSlider::valueChanged, this, [this, slider] { sliderMoves(slider); });
    for (QLineEdit* field : mPane->findChildren<QLineEdit*>()) {
        field->setAcceptDrops(false); // the window takes them
        field->installEventFilter(this);
    }
    mPane->addActions({mHistory->undoAction(), mHistory->redoAction()});
    mPane->setContextMenuPolicy(Qt::ActionsContextMenu);
    showKeys(mPane);
    orderTabs();
}

// The pane is made last but stands above the buttons at the bottom.
void CDlgSettingsImpl::orderTabs() {
    QWidget* last = btnDeletePreset;
    for (QWidget* next = mPane->nextInFocusChain(); mPane->isAncestorOf(next);
         next = next->nextInFocusChain())
        if (next->focusPolicy() != Qt::NoFocus)
            last = next;
    for (QWidget* bottom : std::initializer_list<QWidget*>{btnHelp, btnOK, btnCancel}) {
        setTabOrder(last, bottom);
        last = bottom;
    }
}

void CDlgSettingsImpl::onMy_slider_valueChanged(double) {
    const auto* block = qobject_cast<COrvelaSliderBlockImpl*>(sender());
    settingsChanged(block ? block->lblName->text() : QString());
}

void CDlgSettingsImpl::onMy_slider_stateChanged(bool on) {
    const auto* block = qobject_cast<COrvelaSliderBlockImpl*>(sender());
    const QString name = block ? block->lblName->text() : QString();
    settingsChanged(on ? tr("%1 on").arg(name) : tr("%1 off").arg(name));
}

void CDlgSettingsImpl::onMy_colorPicker_colorChanged(QColor) {
    settingsChanged(tr("Color"));
}

void CDlgSettingsImpl::settingsChanged(const QString& what) {
    if (mTogether)
        return;
    mHistory->note(paneState(), what);
    requestRefresh();
}

// Whatever the action changes is one step.
void CDlgSettingsImpl::together(const QString& what, const std::function<void()>& action) {
    if (mTogether)
        return action();
    {
        const QScopedValueRollback<bool> together(mTogether, true);
        action();
    }
    mHistory->endStep();
    if (mHistory->note(paneState(), what))
        requestRefresh();
    mHistory->endStep();
}

void CDlgSettingsImpl::requestRefresh() {
    mRuns.settingsChanged();
    requestDraft();
}

void CDlgSettingsImpl::sliderMoves(const CThinHorizontalSlider* slider) {
    if (slider->isDragging())
        mHistory->endStep();
    mRuns.settingsMove();
    requestDraft();
}

PaneState CDlgSettingsImpl::paneState() const {
    return {CPresetStore::contentOf(mPane), lstBxPreset->currentText()};
}

void CDlgSettingsImpl::showPaneState(const PaneState& state) {
    const QScopedValueRollback<bool> together(mTogether, true);
    const QSignalBlocker quiet(lstBxPreset);
    const int preset = lstBxPreset->findText(state.preset, Qt::MatchExactly | Qt::MatchCaseSensitive);
    if (preset >= 0)
        lstBxPreset->setCurrentIndex(preset);
    CPresetStore::show(mPane, state.controls);
    requestRefresh();
}

void CDlgSettingsImpl::acceptDropsOn(QWidget* window) {
    window->setAcceptDrops(true);
    window->installEventFilter(this);
}

// Not behind a box, and not without dialogue.
bool CDlgSettingsImpl::takesDrops() const {
    return QApplication::activeModalWidget() == this;
}

bool CDlgSettingsImpl::eventFilter(QObject* watched, QEvent* event) {
    switch (event->type()) {
    case QEvent::ShortcutOverride: // of a field: the history of the pane is that of its text too
        return mHistory->isKey(*static_cast<QKeyEvent*>(event));
    case QEvent::DragEnter:
        if (!takesDrops())
            return false;
        static_cast<QDropEvent*>(event)->acceptProposedAction();
        return true;
    case QEvent::Drop: {
        if (!takesDrops())
            return false;
        auto* drop = static_cast<QDropEvent*>(event);
        drop->acceptProposedAction();
        // Who dragged it waits for the end of this event: no box before.
        mRuns.whenIdle([this, urls = drop->mimeData()->urls()] { loadDropped(urls); });
        return true;
    }
    default:
        return QDialog::eventFilter(watched, event);
    }
}

void CDlgSettingsImpl::loadDropped(const QList<QUrl>& urls) {
    try {
        const QString path = PresetDrop::fileOf(urls);
        CUserParamsPhotoshop now(mMode);
        mPane->writeSettings(now.mSliderParams);
        QStringList left;
        together(QFileInfo(path).fileName(),
                 [&] { left = PresetDrop::load(mPane, mMode, now.mSliderParams, path); });
        if (!left.isEmpty())
            QMessageBox::information(this, tr("Information"),
                                     tr("%1 was loaded without what this window has no slider for: %2")
                                         .arg(QFileInfo(path).fileName(), left.join(QStringLiteral(", "))));
    } catch (const PresetError& error) {
        QMessageBox::warning(this, tr("Warning"), error.shown());
    } catch (const std::exception& error) {
        QMessageBox::warning(this, tr("Warning"), QString::fromUtf8(error.what()));
    }
}
