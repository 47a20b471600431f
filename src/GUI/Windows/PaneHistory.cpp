#include "GUI/Windows/PaneHistory.h"

#include "GUI/Controls/KeyTips.h"

#include <QAction>
#include <QElapsedTimer>
#include <QKeyEvent>

#include <utility>

namespace orvela {

namespace {

constexpr int kSteps = 500;
constexpr qint64 kRestMilliseconds = 1000; // after so long a move is over

// The controls, and what of them, that differ.
QStringList changedBetween(const PresetContent& before, const PresetContent& after) {
    QStringList changed;
    for (qsizetype i = 0; i < std::min(before.sliders.size(), after.sliders.size()); ++i) {
        if (before.sliders[i].value != after.sliders[i].value)
            changed += after.sliders[i].object + QLatin1String(" position");
        if (before.sliders[i].enabled != after.sliders[i].enabled)
            changed += after.sliders[i].object + QLatin1String(" switch");
    }
    if (before.colors != after.colors)
        changed += QStringLiteral("colour");
    return changed;
}

} // namespace

class PaneHistory::Step final : public QUndoCommand {
public:
    Step(PaneHistory& history, PaneState before, PaneState after, bool merges, const QString& what)
        : QUndoCommand(what), mHistory(history), mBefore(std::move(before)), mAfter(std::move(after)),
          mChanged(changedBetween(mBefore.controls, mAfter.controls)), mMerges(merges) {
        mSince.start();
    }

    int id() const override { return 1; }

    bool mergeWith(const QUndoCommand* other) override {
        const auto& next = static_cast<const Step&>(*other);
        if (!next.mMerges || next.mChanged != mChanged || mSince.hasExpired(kRestMilliseconds))
            return false;
        mAfter = next.mAfter;
        mSince.start();
        setObsolete(mAfter.controls == mBefore.controls);
        return true;
    }

    void undo() override { mHistory.showState(mBefore); }

    void redo() override {
        if (!std::exchange(mIsNew, false)) // the user has just done it
            mHistory.showState(mAfter);
    }

private:
    PaneHistory& mHistory;
    PaneState mBefore;
    PaneState mAfter;
    QStringList mChanged;
    QElapsedTimer mSince;
    bool mMerges;
    bool mIsNew = true;
};

PaneHistory::PaneHistory(std::function<void(const PaneState&)> show, QObject* parent)
    : QObject(parent), mShow(std::move(show)), mUndo(new QAction(this)), mRedo(new QAction(this)) {
    mStack.setUndoLimit(kSteps);
    mUndo->setIcon(QIcon(QStringLiteral(":/Tools/Tool_StepBack.png")));
    mUndo->setShortcut(Qt::CTRL | Qt::Key_Z);
    mRedo->setIcon(QIcon(QStringLiteral(":/Tools/Tool_StepForward.png")));
    mRedo->setShortcuts({Qt::CTRL | Qt::SHIFT | Qt::Key_Z, Qt::CTRL | Qt::Key_Y});
    connect(mUndo, &QAction::triggered, &mStack, &QUndoStack::undo);
    connect(mRedo, &QAction::triggered, &mStack, &QUndoStack::redo);
    connect(&mStack, &QUndoStack::indexChanged, this, &PaneHistory::updateActions);
    updateActions();
}

void PaneHistory::begin(const PaneState& now) {
    mNow = now;
    mMayMerge = false;
    mStack.clear();
    updateActions();
}

bool PaneHistory::note(const PaneState& now, const QString& what) {
    const PaneState before = std::exchange(mNow, now);
    if (before.controls == now.controls)
        return false;
    mStack.push(new Step(*this, before, now, std::exchange(mMayMerge, true), what));
    updateActions(); // one that was merged keeps the index
    return true;
}

bool PaneHistory::isKey(const QKeyEvent& event) const {
    const QKeySequence key(event.keyCombination());
    return mUndo->shortcuts().contains(key) || mRedo->shortcuts().contains(key);
}

void PaneHistory::setUsable(bool usable) {
    mUsable = usable;
    updateActions();
}

void PaneHistory::showState(const PaneState& state) {
    mNow = state;
    mMayMerge = false;
    mShow(state);
}

void PaneHistory::updateActions() {
    const auto update = [this](QAction* action, bool possible, const QString& name, const QString& step) {
        action->setEnabled(mUsable && possible);
        QString text = step.isEmpty() ? name : tr("%1: %2", "undo or redo: what").arg(name, step);
        action->setToolTip(withKeys(text, action->shortcuts()));
        action->setText(text.replace(QLatin1Char('&'), QLatin1String("&&"))); // in menus it marks a key
    };
    update(mUndo, mStack.canUndo(), tr("Undo"), mStack.undoText());
    update(mRedo, mStack.canRedo(), tr("Redo"), mStack.redoText());
}

} // namespace orvela
