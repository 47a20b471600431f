#pragma once

#include "GUI/forms/ui_CDlgCustomPreset.h"

#include <QDialog>

#include <functional>

/// Asks for one of the presets of Advanced. Lives for one choice and opens where the last one was closed.
class CDlgCustomPresetImpl final : public QDialog, public Ui::CDlgCustomPreset {
    Q_OBJECT

public:
    /// Shows a page of the manual: that of the main window.
    using HelpOpener = std::function<void(const QString& page)>;

    CDlgCustomPresetImpl(QWidget* parent, HelpOpener openHelpPage);

    /// The accepted preset: its place in the list, -1 when there is none, and its name.
    int chosenIndex() const { return mChosenIndex; }
    const QString& chosenText() const { return mChosenText; }

    /// Has the user choose. @return the name of the preset, empty when there was no choice
    /// @throws CGenericEx when the settings store holds no presets of any mode
    static QString choose(QWidget* parent, const HelpOpener& openHelpPage);

public Q_SLOTS:
    void on_btnOK_clicked();
    void on_btnCancel_clicked();
    void on_btnHelp_clicked();
    void done(int result) override;

private:
    void fillList();

    HelpOpener mOpenHelpPage;
    int mChosenIndex = -1;
    QString mChosenText;
};
