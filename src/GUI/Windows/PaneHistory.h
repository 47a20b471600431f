#pragma once

#include "Settings/PresetTree.h"

#include <QUndoStack>

#include <functional>

class QAction;
class QKeyEvent;

namespace orvela {

/// What the user has set a pane to: its controls, and the preset that is chosen beside it.
struct PaneState {
    PresetContent controls;
    QString preset;
};

/// The states that the user led a pane through, and the actions that go back and forth between them. A drag,
/// a choice of a preset and everything else that happens at once is one step; so are repeated small moves of
/// one control, such as those of keys and wheel.
class PaneHistory : public QObject {
    Q_OBJECT

public:
    /// @param show  puts the pane to a state
    explicit PaneHistory(std::function<void(const PaneState&)> show, QObject* parent = nullptr);

    /// Their texts tell what they would undo and redo.
    QAction* undoAction() const { return mUndo; }
    QAction* redoAction() const { return mRedo; }

    /// Forgets everything; the pane stands at `now`.
    void begin(const PaneState& now);
    /// Takes note that the user changed `what`.
    /// @return whether the controls stand otherwise than before
    bool note(const PaneState& now, const QString& what);
    /// What comes next is a step of its own, however small.
    void endStep() { mMayMerge = false; }
    /// Whether the key is one of the actions'.
    bool isKey(const QKeyEvent& event) const;
    /// Whether the pane may be changed at present.
    void setUsable(bool usable);

private:
    class Step;

    void showState(const PaneState& state);
    void updateActions();

    std::function<void(const PaneState&)> mShow;
    QUndoStack mStack;
    PaneState mNow;
    bool mMayMerge = false;
    bool mUsable = true;
    QAction* mUndo;
    QAction* mRedo;
};

} // namespace orvela
