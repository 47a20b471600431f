#pragma once

#include "Settings/CUserParams.h"
#include "Settings/PaneTable.h"

#include <QWidget>

class CARGBPlane;
class CColorPicker;
class COrvelaSliderBlockImpl;
class CThreadedCore;
class QComboBox;
class QLayout;

/// The controls of one family of modes: knows how they are labelled and scaled, which setting each of them
/// drives and which core works with them.
class IWgtPane : public QWidget {
    Q_OBJECT

public:
    /// @param owner  the window that the pane belongs to, which follows the changes of the controls
    IWgtPane(QWidget* owner, EGUIMode mode);

    EGUIMode mode() const { return mMode; }
    /// Whether the window offers presets beside this pane.
    bool showsPresets() const { return mShowsPresets; }
    /// Whether changes are processed by themselves until the user decides otherwise.
    bool autoRefresh() const { return mAutoRefresh; }
    /// Whether the pane goes on from the processed image rather than from the original.
    bool takesProcessedImage() const { return mTakesProcessedImage; }

    /// Writes the states, colours and exact positions of the controls into the fields of `params` that they
    /// drive, for a run; panes log it.
    virtual void applyGUIParams(CUserParams& params) { writeSettings(params.mSliderParams); }

    /// Makes the core of the pane's modes, a child of `owner`. The planes are not owned.
    virtual CThreadedCore* createCore(CARGBPlane* inPlane, CARGBPlane* outPlane, QObject* owner) = 0;

    /// The same without a word: a slider that is moved asks for a draft at every step.
    virtual void writeSettings(CSliderParams& settings) const = 0;

    /// Puts the controls to a factory preset.
    void setSliders(const QString& presetName);

protected:
    /// What setSliders() does once every slider is off and at position 500.
    virtual void doSetSliders(const QString& presetName);

public:
    /// Adds the pane's own entries.
    virtual void fillPresetList(QComboBox* list);

Q_SIGNALS:
    /// The user asks for the pane of another mode.
    void changeMode(EGUIMode mode);

protected:
    /// Labels the block and puts it to position 500.
    void setUpSlider(COrvelaSliderBlockImpl* block, const QString& label);
    /// Gives the slider's block all that its description holds, the state and the position (0 to 1000).
    void setUpSlider(const orvela::PaneSlider& slider, bool on, double position);
    /// Sets up every slider with the states and positions of `settings`.
    void setUpSliders(std::span<const orvela::PaneSlider> sliders, const CSliderParams& settings);
    /// Shows a picker of that colour below the track of its slider while that is on.
    void setUpColorPicker(CColorPicker* picker, const orvela::PaneColor& color,
                          COrvelaSliderBlockImpl* slider);
    /// Gives every picker the colour that it has in `settings`.
    void showColors(std::span<const orvela::PaneColor> colors, const CSliderParams& settings);

    /// Writes exact position and state of every slider into the fields that it drives.
    void writeSliders(std::span<const orvela::PaneSlider> sliders, CSliderParams& settings) const;
    /// Writes the colour of every picker into its fields.
    void writeColors(std::span<const orvela::PaneColor> colors, CSliderParams& settings) const;

    /// Disables `button` when a run of `core` starts and enables it again when it was completed.
    void enableAfterRuns(QWidget* button, CThreadedCore* core);

    bool event(QEvent* event) override;

    bool mShowsPresets = false;
    bool mAutoRefresh = false;
    bool mTakesProcessedImage = false;

private:
    void resetSliders();
    void alignColumns();
    COrvelaSliderBlockImpl* block(const orvela::PaneSlider& slider) const;
    CColorPicker* picker(const orvela::PaneColor& color) const;

    EGUIMode mMode;
    QList<std::pair<QLayout*, const COrvelaSliderBlockImpl*>> mPickerRows; ///< each below its slider
};
