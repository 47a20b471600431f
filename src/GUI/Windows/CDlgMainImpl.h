#pragma once

#include "GUI/forms/ui_CDlgMain.h"
#include "Settings/EGUIMode.h"

#include <QDialog>

#include <exception>

class CARGBPlane;

/// The first window of a start of the filter: a narrow column of buttons, one for each way of working. A mode
/// runs in a window of its own; when its result is accepted this window closes with acceptance.
class CDlgMainImpl : public QDialog, private Ui::CDlgMain {
    Q_OBJECT

public:
    /// @param hostWindow  the host's native window, null for none
    /// @param inPlane, outPlane  not owned; every mode runs on them
    CDlgMainImpl(void* hostWindow, CARGBPlane* inPlane, CARGBPlane* outPlane);
    ~CDlgMainImpl() override;

    /// Lets the user work, or replays the last operation in batch mode without showing the window.
    /// @return whether the output plane holds a result that is to be written back
    /// @throws what kept a mode from running
    bool run();

    void done(int result) override;

public Q_SLOTS:
    void on_btnCollapse_clicked();
    void on_btnExpand_clicked();
    void on_btnAddIllumination_clicked();
    void on_btnAutomatic_clicked();
    void on_btnAutoLevels_clicked();
    void on_btnAutoContrast_clicked();
    void on_btnAutoColor_clicked();
    void on_btnAutoSaturation_clicked();
    void on_btnAdjustments_clicked();
    void on_btnIndivFilters_clicked();
    void on_btnAdvanced_clicked();
    void on_btnCustomPresets_clicked();
    void on_btnToggleBatchMode_clicked();
    void on_btnHelp_clicked();
    void on_btnAbout_clicked();
    void indivFilterActionClicked();
    void doAbout(QDialog* parent);
    void doAbout();
    void doProgramInfos(QDialog* parent);
    void doProgramInfos();
    /// Opens a topic of the manual.
    void openHelpPage(const QString& page);

protected:
    void closeEvent(QCloseEvent* event) override;

private:
    void startMode(EGUIMode mode);
    void runMode(EGUIMode mode);
    void restoreState();
    void showUpdateLink();
    void setButtonTexts(bool shown);
    QList<QToolButton*> ownButtons() const;
    void setButtonWidths(int width, const char* styleSheet);
    void tellBatchMode();
    void nameBatchButton();
    void refreshBatchButton();
    bool isExpanded() const { return btnCollapse->isVisibleTo(this); }

    CARGBPlane* mInPlane;
    CARGBPlane* mOutPlane;
    bool mBatchStateChanged = false;
    bool mWantedBatchState = false;
    std::exception_ptr mFailure; ///< of a mode, for the caller of run()
};
