#include "GUI/Windows/Previews.h"

#include "Core/CThreadedCore.h"
#include "GUI/Preview/CSignaledGraphicsView.h"
#include "GUI/Preview/HistogramView.h"
#include "GUI/Preview/PreviewBar.h"
#include "GUI/Windows/CDlgDualPreviewImpl.h"
#include "GUI/Windows/CDlgSinglePreviewImpl.h"
#include "GUI/Windows/WindowSetup.h"
#include "Settings/PresetTree.h"
#include "Settings/SettingsEdit.h"

#include <QAction>
#include <QApplication>
#include <QKeyEvent>
#include <QScreen>
#include <QScrollBar>
#include <QSettings>

#include <algorithm>
#include <cmath>

namespace orvela {

namespace {

constexpr qint64 kStepMilliseconds = 40; // the eye does not follow more than 25 pictures a second
constexpr int kDraftMargin = 8;          // pixels that filters look at around one
constexpr double kLineStep = 0.02;       // of the width, at a press of a key
constexpr QSize kSmallest(160, 120);
constexpr Qt::Key kHoldKey = Qt::Key_F2; // besides the space bar over a picture

} // namespace

/// A window whose place is stored.
struct Previews::StoredWindow {
    const char* name;
    QWidget* window;

    QString key(const char* what) const {
        return PresetTree::guiKey(QLatin1String(name) + QLatin1String(what));
    }
};

Previews::Previews(QWidget* owner)
    : QObject(owner), mOwner(owner), mOriginalView(makeView(mOriginal)), mProcessedView(makeView(mProcessed)),
      mBar(new PreviewBar), mJoined(new CDlgDualPreviewImpl(owner)), mOrig(new CDlgSinglePreviewImpl(owner)),
      mProc(new CDlgSinglePreviewImpl(owner)) {
    mOriginalView->setAccessibleName(tr("Original picture"));
    mProcessedView->setAccessibleName(tr("Processed picture"));
    mJoined->setWindowTitle(tr("Original and Processed Pictures (Preview)"));
    mOrig->setWindowTitle(tr("Original Picture (Preview)"));
    mProc->setWindowTitle(tr("Processed Picture (Preview)"));
    for (QWidget* view : {mOriginalView, mProcessedView})
        mJoined->horizontalLayout->addWidget(view);
    mJoined->verticalLayout->addWidget(mBar);
    connect(mBar, &PreviewBar::fitRequested, this, [this] { zoomTo(ZoomTable::kFit); });
    connect(mBar, &PreviewBar::pixelsRequested, this, &Previews::zoomToPixels);
    connect(mBar, &PreviewBar::comparingChanged, this, &Previews::setComparing);
    addKey(Qt::Key_0, Qt::ControlModifier, [this] { zoomTo(ZoomTable::kFit); });
    addKey(Qt::Key_1, Qt::ControlModifier, [this] { zoomToPixels(); });
    addKey(Qt::Key_F3, {}, [this] { setComparing(!isComparing()); });
    addKey(Qt::Key_Left, Qt::AltModifier, [this] { mProcessed.moveLine(-kLineStep); });
    addKey(Qt::Key_Right, Qt::AltModifier, [this] { mProcessed.moveLine(kLineStep); });
    mBar->tellKeys(mKeys, kHoldKey);
    qApp->installEventFilter(this);
    for (QScrollBar* bar : {mProcessedView->horizontalScrollBar(), mProcessedView->verticalScrollBar()})
        connect(bar, &QScrollBar::valueChanged, this, &Previews::seenPartChanged);
}

// The views would outlive their scenes: the windows belong to the owner.
Previews::~Previews() {
    mOriginalView->setScene(nullptr);
    mProcessedView->setScene(nullptr);
}

void Previews::addKey(Qt::Key key, Qt::KeyboardModifiers modifiers, const std::function<void()>& action) {
    auto* keyAction = new QAction(this);
    keyAction->setShortcut(QKeyCombination(modifiers, key));
    connect(keyAction, &QAction::triggered, this, action);
    mKeys.append(keyAction);
}

QList<QWidget*> Previews::windows() const {
    return {mJoined, mOrig, mProc};
}

CSignaledGraphicsView* Previews::makeView(PreviewPicture& picture) {
    auto* view = new CSignaledGraphicsView(&picture.scene());
    view->setFrameStyle(QFrame::Panel);
    view->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    view->setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    view->setDragMode(QGraphicsView::ScrollHandDrag);
    view->setBackgroundBrush(Qt::black);
    view->setMinimumSize(kSmallest);
    view->viewport()->setAcceptDrops(false); // the window takes them
    return view;
}

void Previews::showOriginal(const CARGBPlane& picture) {
    mOriginal.show(picture);
    mProcessed.setBefore(mOriginal.plane());
    const LevelCounts counts = LevelCounts::of(picture);
    mBar->histogram().setBefore(counts);
    mBar->histogram().setCounts(counts);
}

void Previews::showProcessed(const CARGBPlane& picture) {
    mProcessed.show(picture);
    mBar->setDraft(false);
    mBar->histogram().setCounts(LevelCounts::of(picture));
}

void Previews::showStep(const CThreadedCore& core) {
    if (mSinceStep.isValid() && !mSinceStep.hasExpired(kStepMilliseconds))
        return;
    const auto [area, reduction] = seen();
    mProcessed.showPart(core.snapshot(area, reduction), area);
    mBar->setDraft(false);
    mSinceStep.start();
}

void Previews::dropStep() {
    mProcessed.dropPart();
    mBar->setDraft(false);
}

Previews::Seen Previews::draftPart(double pixelsAtOnce) const {
    Seen part = seen();
    const QRect whole = mProcessed.scene().sceneRect().toRect();
    const auto pixels = [&] {
        return static_cast<double>(part.area.width()) * part.area.height() /
               (part.reduction * part.reduction);
    };
    part.reduction = 1;
    while (pixels() > pixelsAtOnce)
        ++part.reduction;
    const int margin = kDraftMargin * part.reduction;
    part.area = part.area.adjusted(-margin, -margin, margin, margin) & whole;
    return part;
}

void Previews::showDraft(std::shared_ptr<const CARGBPlane> part, const QRect& area) {
    mProcessed.showPart(std::move(part), area);
    mBar->setDraft(true);
}

double Previews::deviceScale() const {
    return mProcessedView->transform().m11() * mProcessedView->devicePixelRatioF();
}

Previews::Seen Previews::seen() const {
    Seen seen;
    seen.reduction = std::max(1, static_cast<int>(1 / std::max(deviceScale(), 1e-3)));
    const QRectF shown = mProcessedView->mapToScene(mProcessedView->viewport()->rect()).boundingRect();
    seen.area = shown.toAlignedRect() & mProcessed.scene().sceneRect().toRect();
    return seen;
}

void Previews::setSplit(bool split) {
    mSplit = split;
    if (split) {
        mOrig->horizontalLayout->addWidget(mOriginalView);
        mProc->horizontalLayout->addWidget(mProcessedView);
        mProc->verticalLayout->addWidget(mBar);
    } else {
        mJoined->horizontalLayout->addWidget(mOriginalView);
        mJoined->horizontalLayout->addWidget(mProcessedView);
        mJoined->verticalLayout->addWidget(mBar);
    }
    mJoined->setVisible(!split);
    mOrig->setVisible(split);
    mProc->setVisible(split);
}

void Previews::hide() {
    for (QWidget* window : windows())
        window->hide();
}

void Previews::fitWidth(const QRect& viewGeometry) {
    const double width = mOriginal.scene().width();
    if (width <= 0)
        return;
    mBaseScale = static_cast<float>((viewGeometry.right() - viewGeometry.left() + 1) / width);
    scaleTo(static_cast<double>(mBaseScale));
}

void Previews::scaleTo(double scale) {
    for (QGraphicsView* view : {mOriginalView, mProcessedView}) {
        view->setTransform(QTransform::fromScale(scale, scale));
        view->setSceneRect(QRectF()); // the scene's: lays it out anew also where only the height is another
    }
    Q_EMIT seenPartChanged();
}

void Previews::zoomTo(int step) {
    const std::span<const double> table = ZoomTable::percentages();
    mStep = std::clamp(step, 0, static_cast<int>(table.size()) - 1);
    Q_EMIT zoomChanged(ZoomTable::text(mStep));
    scaleTo(table[static_cast<std::size_t>(mStep)] / 100 * static_cast<double>(mBaseScale));
}

void Previews::zoomAround(CSignaledGraphicsView* view, int notches, QPoint at) {
    const QPointF point = view->mapToScene(at);
    zoomTo(mStep + notches);
    const QPoint moved = view->mapFromScene(point) - at;
    view->horizontalScrollBar()->setValue(view->horizontalScrollBar()->value() + moved.x());
    view->verticalScrollBar()->setValue(view->verticalScrollBar()->value() + moved.y());
    CSignaledGraphicsView* other = view == mOriginalView ? mProcessedView : mOriginalView;
    align(other, view->horizontalScrollBar()->value(), view->verticalScrollBar()->value());
}

void Previews::zoomToPixels() {
    const double scale = 1 / mProcessedView->devicePixelRatioF();
    mStep = ZoomTable::nearest(100 * scale / static_cast<double>(mBaseScale));
    scaleTo(scale);
    Q_EMIT zoomChanged(tr("1:1"));
}

void Previews::align(CSignaledGraphicsView* view, int x, int y) {
    view->horizontalScrollBar()->setValue(x);
    view->verticalScrollBar()->setValue(y);
}

void Previews::setHeld(bool held) {
    mProcessed.setHeld(held);
}

void Previews::setComparing(bool comparing) {
    mProcessed.setComparing(comparing);
    mBar->setComparing(comparing);
}

bool Previews::isHoldKey(const QObject* watched, int key) const {
    if (key == Qt::Key_Space)
        return watched == mOriginalView || watched == mProcessedView;
    const auto* widget = qobject_cast<const QWidget*>(watched);
    return key == kHoldKey && widget && (widget->window() == mOwner || windows().contains(widget->window()));
}

// Of the whole program: a field that has the focus would keep the release of a key.
bool Previews::eventFilter(QObject* watched, QEvent* event) {
    switch (event->type()) {
    case QEvent::KeyPress:
    case QEvent::KeyRelease: {
        const auto* key = static_cast<QKeyEvent*>(event);
        if (!isHoldKey(watched, key->key()))
            return false;
        if (!key->isAutoRepeat())
            setHeld(event->type() == QEvent::KeyPress);
        return true;
    }
    case QEvent::FocusOut: // the release goes elsewhere
    case QEvent::WindowDeactivate:
        setHeld(false);
        return false;
    default:
        return false;
    }
}

std::array<Previews::StoredWindow, 3> Previews::storedWindows() const {
    return {{{"PreviewWindows", mJoined}, {"PreviewWindows/Orig", mOrig}, {"PreviewWindows/Proc", mProc}}};
}

void Previews::saveTo(SettingsEdit& edit) const {
    for (const StoredWindow& stored : storedWindows()) {
        edit.set(stored.key("/size"), stored.window->size());
        edit.set(stored.key("/pos"), stored.window->pos());
    }
}

void Previews::restoreFrom(const QSettings& settings) {
    placeBesideOwner();
    for (const StoredWindow& stored : storedWindows()) {
        const QVariant size = settings.value(stored.key("/size"));
        const QVariant place = settings.value(stored.key("/pos"));
        if (size.toSize().isValid())
            stored.window->resize(size.toSize());
        if (place.canConvert<QPoint>() && isReachable(place.toPoint(), stored.window->width()))
            stored.window->move(place.toPoint());
    }
}

// As large as what the screen leaves beside the owner; the pictures keep their shape.
void Previews::placeBesideOwner() {
    constexpr int gap = 8;
    const QRect screen = mOwner->screen()->availableGeometry();
    const QRect owner = mOwner->frameGeometry();
    const bool rightHand = screen.right() - owner.right() >= owner.left() - screen.left();
    const int room = rightHand ? screen.right() - owner.right() : owner.left() - screen.left();
    const int width = std::max(room - 2 * gap, screen.width() / 2);
    const int left = rightHand ? screen.right() - gap - width : screen.left() + gap;
    const double shape =
        mOriginal.scene().width() > 0 ? mOriginal.scene().height() / mOriginal.scene().width() : 0.75;
    const int most = screen.height() * 4 / 5;
    const int below = mBar->sizeHint().height() + 3 * gap;
    const auto heightFor = [&](int view) { return std::min(most, static_cast<int>(view * shape) + below); };
    const int top = std::clamp(owner.top(), screen.top(), std::max(screen.top(), screen.bottom() - most));
    mJoined->setGeometry(left, top, width, heightFor(width / 2));
    mOrig->setGeometry(left, top, width / 2 - gap, heightFor(width / 2) - mBar->sizeHint().height() - gap);
    mProc->setGeometry(left + width / 2, top, width / 2 - gap, heightFor(width / 2));
}

} // namespace orvela
