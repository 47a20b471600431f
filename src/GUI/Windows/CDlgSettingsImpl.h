#pragma once

#include "GUI/Windows/RunControl.h"
#include "GUI/forms/ui_CDlgSettings.h"
#include "Settings/EGUIMode.h"

#include <QDialog>
#include <QPointer>
#include <QTimer>

#include <exception>
#include <functional>
#include <memory>

class CARGBPlane;
class CThreadedCore;
class CThinHorizontalSlider;
class IWgtPane;

namespace orvela {
class DraftRunner;
class MeasurementTape;
class PaneHistory;
class Previews;
struct PaneState;
} // namespace orvela

/// The window in which a mode runs: the sliders of the mode, previews of the original and the processed
/// picture, presets, progress. Automatic modes, custom presets and batch replays run in it too, as progress
/// and a stop button that close by themselves. Every slot may be called in the middle of a run, whose events
/// are served: see RunControl.
class CDlgSettingsImpl : public QDialog, private Ui::CDlgSettings, private orvela::RunControl::Window {
    Q_OBJECT

public:
    /// @param inPlane, outPlane  not owned; the original picture is the one that the plane proxy holds
    CDlgSettingsImpl(EGUIMode mode, CARGBPlane* inPlane, CARGBPlane* outPlane, QWidget* parent = nullptr,
                     Qt::WindowFlags flags = {});
    ~CDlgSettingsImpl() override;

    /// What opens a topic of the manual.
    void setHelp(const std::function<void(const QString& topic)>& openPage) { mOpenPage = openPage; }

    /// Whether a batch mode that is switched on replaces the mode; true unless it is said otherwise.
    void setObeysBatchMode(bool obeys) { mObeysBatchMode = obeys; }

    /// Runs the mode, or replays the last operation in batch mode. Returns when the window was closed, or a
    /// run without dialogue ended.
    /// @throws CGenericEx what kept the mode from running
    void run();

    /// After run(): whether the output plane holds a result that is to be used.
    bool appliesOnFinish() const { return mRuns.applies() && result() == Accepted; }

    /// Loads the preset into the pane. No slot: the list has no signal of that name and argument any more,
    /// and one that is looked for by name would be missed with a warning.
    void on_lstBxPreset_currentIndexChanged(const QString& name);

public Q_SLOTS:
    void onMy_slider_valueChanged(double value);
    void onMy_slider_stateChanged(bool on);
    void onMy_colorPicker_colorChanged(QColor color);
    void changeMode(EGUIMode mode);
    void enableProfiling(bool enabled);
    void previewWindowSizeChanged(QRect geometry);
    void setSplitView(bool split);
    void restoreWindowsStates();
    void on_btnSplitPreviews_clicked();
    void on_btnGluePreviews_clicked();
    void on_btnRevertPreset_clicked();
    void on_btnSavePreset_clicked();
    void on_btnDeletePreset_clicked();
    void onMy_grphVwOriginal_scrolled(int x, int y);
    void onMy_grphVwProcessed_scrolled(int x, int y);
    void on_btnZoomIn_clicked();
    void on_btnZoomOut_clicked();
    void on_btnRefresh_clicked();
    void on_chkBxAutoRefresh_clicked(bool checked);
    void on_btnStopProcessing_clicked();
    void on_btnTurnAllOn_clicked();
    void on_btnTurnAllOff_clicked();
    void on_btnOK_clicked();
    void on_btnCancel_clicked();
    void on_btnHelp_clicked();
    void onMy_thrdCore_percentDone(int percent);
    void onMy_thrdCore_stepDone(int step, int total, const QString& name);
    void onMy_thrdCore_stepDone(int step, int total);
    void onMy_thrdCore_started();
    void onMy_thrdCore_finished();
    void onMy_this_finished(int result);

    /// Records the settings for a batch replay and closes.
    void accept() override;
    /// Stops a run, whose result is not used, and closes.
    void reject() override;

protected:
    /// Presets are dropped on this window and those of the previews.
    bool eventFilter(QObject* watched, QEvent* event) override;
    /// A pane that unfolds must not push the buttons off the screen.
    void resizeEvent(QResizeEvent* event) override;

private:
    // CDlgSettingsImpl.cpp: the window and its modes
    void runPreset(EGUIMode mode);
    void runBatch(EGUIMode mode);
    void runInteractive(EGUIMode mode);
    void runWithoutDialogue();
    void leavePane(EGUIMode mode);
    void makePane(EGUIMode mode);
    void beginPane(bool wasUpToDate);
    void makeCore();
    void prepareInput();
    const CARGBPlane& original() const;
    void turnAll(bool on);
    void storeWindowsStates() const;

    // CDlgSettingsKeys.cpp
    void addKeys();
    void addKeysToPreviews();
    void showKeys(const QWidget* root);

    // CDlgSettingsPane.cpp: what the user does to the pane
    void preparePane();
    void orderTabs();
    orvela::PaneState paneState() const;
    void showPaneState(const orvela::PaneState& state);
    void together(const QString& what, const std::function<void()>& action);
    void settingsChanged(const QString& what);
    void sliderMoves(const CThinHorizontalSlider* slider);
    void requestRefresh();
    void acceptDropsOn(QWidget* window);
    bool takesDrops() const;
    void loadDropped(const QList<QUrl>& urls);

    // CDlgSettingsPresets.cpp
    void fillPresets();
    void selectPreset(const QString& name);
    void selectStoredPreset();
    static QString selectedPresetKey();
    bool savePresetAs(const QString& name, bool asks, bool& isNew);

    // CDlgSettingsPreviews.cpp
    void makePreviews();
    void requestDraft();
    void makeDraft();
    void dropDrafts();
    void seenPartChanged();
    void showResult();
    void showing(const std::function<void()>& action);

    // CDlgSettingsRuns.cpp
    bool isOpen() const override { return isVisible(); }
    bool prepareRun() override;
    void runCore() override;
    void stopCore() override;
    bool isRunComplete() const override;
    void runEnded() override;
    bool useResult() override;
    bool isUserBusy() const override;
    void rest(bool resting);
    void parkFocus(const QWidget* part);
    void giveFocusBack();
    void applyNonIteractiveMode();
    QString failureText() const;
    bool isWantedDespite(const QString& failure);
    void tell(const QString& failure);
    bool guarded(const std::function<void()>& action);

    EGUIMode mMode;
    CARGBPlane* mInPlane;
    CARGBPlane* mOutPlane;
    IWgtPane* mPane = nullptr;
    CThreadedCore* mCore = nullptr;
    orvela::RunControl mRuns{*this};
    std::unique_ptr<orvela::Previews> mPreviews; ///< none without dialogue
    std::unique_ptr<orvela::DraftRunner> mDrafts;
    std::shared_ptr<const CARGBPlane> mOriginalCopy;     ///< for drafts
    std::shared_ptr<orvela::MeasurementTape> mTape;      ///< of the run under way
    std::shared_ptr<orvela::MeasurementTape> mWholeTape; ///< of the last whole run
    orvela::PaneHistory* mHistory;
    QTimer mDraftTimer{this};
    QTimer mRestoreTimer{this};
    std::function<void(const QString&)> mOpenPage;

    bool mDraftsSeen = false; ///< in the place of a result
    bool mTogether = false;   ///< changes of the pane belong to one
    bool mRunInNonInteractiveMode = false;
    bool mObeysBatchMode = true;
    bool mReplays = false;          ///< the last operation, with nobody there
    QPointer<QWidget> mFocusBefore; ///< the run
    QString mTold;                  ///< failure of the last run
    bool mStatesRestored = false;
    std::exception_ptr mFailure; ///< for the caller of run()

    QString mSelectedPreset;  ///< the last one of Advanced
    int mAdvancedPreset = -1; ///< kept while in Final Touch
    bool mAdvancedAutoRefresh = false;
};
