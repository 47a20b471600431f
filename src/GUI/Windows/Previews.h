#pragma once

#include "GUI/Preview/PreviewPicture.h"
#include "GUI/Preview/ZoomTable.h"

#include <QElapsedTimer>
#include <QObject>

#include <array>
#include <functional>

class CDlgDualPreviewImpl;
class CDlgSinglePreviewImpl;
class CSignaledGraphicsView;
class CThreadedCore;
class QAction;
class QSettings;
class QWidget;

namespace orvela {

class PreviewBar;
class SettingsEdit;

/// The previews of a processing window: the original and the processed picture, side by side in one window or
/// in a window each, at the same zoom and the same place.
class Previews : public QObject {
    Q_OBJECT

public:
    /// Makes the windows, hidden, above `owner`.
    explicit Previews(QWidget* owner);
    ~Previews() override;

    CSignaledGraphicsView* originalView() const { return mOriginalView; }
    CSignaledGraphicsView* processedView() const { return mProcessedView; }

    /// Each shows a copy of the picture.
    /// @throws CGenericEx when the memory cannot be had
    void showOriginal(const CARGBPlane& picture);
    void showProcessed(const CARGBPlane& picture);

    /// Shows the picture of a run as it stands between two tasks, where and as finely as it is seen; not more
    /// often than the eye can follow.
    void showStep(const CThreadedCore& core);
    /// The next step is shown however soon it comes.
    void showNextStep() { mSinceStep.invalidate(); }
    /// Shows the last whole picture in place of the steps or the draft after it.
    void dropStep();

    /// The part of the processed picture that is seen, in its pixels, and how many of them, in a row, become
    /// one of the screen (1 at least).
    struct Seen {
        QRect area;
        int reduction = 1;
    };
    Seen seen() const;

    /// What a draft is made of: the part that is seen with what lies around it, as fine as so many pixels
    /// allow.
    Seen draftPart(double pixelsAtOnce) const;

    /// Shows a draft of a part until the next picture or step is shown.
    void showDraft(std::shared_ptr<const CARGBPlane> part, const QRect& area);

    /// The copy of the original that is shown.
    std::shared_ptr<const CARGBPlane> originalCopy() const { return mOriginal.plane(); }

    /// The windows, whichever are shown.
    QList<QWidget*> windows() const;
    /// Fit, 100 % and the line to compare by. F2, held in any of the windows or the owner's, shows the
    /// original; so does Space in the pictures.
    const QList<QAction*>& keys() const { return mKeys; }

    /// Shows the windows: two when split.
    void setSplit(bool split);
    bool isSplit() const { return mSplit; }
    void hide();

    /// Fits the pictures to the width of a view; the zoom that is told stays.
    void fitWidth(const QRect& viewGeometry);

    /// Moves both pictures to a step of the zoom table, of which there are ends.
    void zoomTo(int step);
    void zoomIn() { zoomTo(mStep + 1); }
    void zoomOut() { zoomTo(mStep - 1); }
    /// Moves by so many steps; what `view` shows at that place stays there.
    void zoomAround(CSignaledGraphicsView* view, int notches, QPoint at);
    /// Every pixel of the picture on one of the screen.
    void zoomToPixels();

    /// Scrolls one view to where the other one is.
    static void align(CSignaledGraphicsView* view, int x, int y);

    /// The whole original in place of the processed picture while held.
    void setHeld(bool held);
    void setComparing(bool comparing);
    bool isComparing() const { return mProcessed.isComparing(); }

    /// Puts places and sizes of the windows into `edit`.
    void saveTo(SettingsEdit& edit) const;
    /// Moves the windows to stored places, or beside their owner.
    void restoreFrom(const QSettings& settings);

Q_SIGNALS:
    /// What the zoom is called now.
    void zoomChanged(const QString& text);
    /// Another part of the pictures, or as many pixels of the screen for it, than before.
    void seenPartChanged();

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    CSignaledGraphicsView* makeView(PreviewPicture& picture);
    void addKey(Qt::Key key, Qt::KeyboardModifiers modifiers, const std::function<void()>& action);
    bool isHoldKey(const QObject* watched, int key) const;
    void scaleTo(double scale);
    double deviceScale() const;
    void placeBesideOwner();
    struct StoredWindow;
    std::array<StoredWindow, 3> storedWindows() const;

    QWidget* mOwner;
    PreviewPicture mOriginal;
    PreviewPicture mProcessed;
    CSignaledGraphicsView* mOriginalView;
    CSignaledGraphicsView* mProcessedView;
    PreviewBar* mBar;
    CDlgDualPreviewImpl* mJoined;
    CDlgSinglePreviewImpl* mOrig;
    CDlgSinglePreviewImpl* mProc;
    QList<QAction*> mKeys;
    bool mSplit = false;
    int mStep = ZoomTable::kFit;
    float mBaseScale = 1;
    QElapsedTimer mSinceStep;
};

} // namespace orvela
