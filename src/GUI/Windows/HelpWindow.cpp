#include "GUI/Windows/HelpWindow.h"

#include "GUI/Controls/Artwork.h"
#include "GUI/Controls/KeyTips.h"
#include "GUI/Presets/StoreWriting.h"
#include "GUI/Windows/HelpBrowser.h"
#include "GUI/Windows/HelpPages.h"
#include "Platform/HelpViewer.h"
#include "Settings/PresetTree.h"
#include "Settings/SettingsStore.h"
#include "Utility/DebugBoxes.h"

#include <QAbstractButton>
#include <QAction>
#include <QApplication>
#include <QEvent>
#include <QFile>
#include <QLabel>
#include <QLineEdit>
#include <QPointer>
#include <QShortcut>
#include <QSplitter>
#include <QStyle>
#include <QTimer>
#include <QToolBar>
#include <QTreeWidget>
#include <QVBoxLayout>
#include <QWindow>

#include <algorithm>
#include <bit>

namespace orvela {

namespace {

constexpr int kAddress = Qt::UserRole; // of the entries of the table of contents
constexpr QSize kSize(960, 700);
constexpr int kContentsWidth = 250;
constexpr int kRowSpace = 7;
constexpr Qt::Key kNextPlace = Qt::Key_F3;
constexpr QKeyCombination kPlaceBefore = Qt::SHIFT | kNextPlace;

QString placeKey() {
    return PresetTree::guiKey(QStringLiteral("HelpWindow/geometry"));
}

} // namespace

HelpWindow::HelpWindow(QWidget* owner)
    : QWidget(owner, Qt::Window), mPage(new HelpBrowser(this)), mContents(new QTreeWidget(this)),
      mSearch(new QLineEdit(this)), mMissing(new QLabel(this)), mFollow(new QTimer(this)) {
    setObjectName(QStringLiteral("HelpWindow"));
    setWindowTitle(tr("Orvela Manual"));
    setAttribute(Qt::WA_ShowWithoutActivating); // when it goes over to another window
    layOut();
    fillContents();
    addShortcuts();
    mFollow->setSingleShot(true);
    connect(mFollow, &QTimer::timeout, this, &HelpWindow::followModalWindow);
    connect(mPage, &HelpBrowser::sourceChanged, this, &HelpWindow::markEntry);
    connect(mContents, &QTreeWidget::currentItemChanged, this, &HelpWindow::showEntry);
    connect(mSearch, &QLineEdit::textEdited, this,
            [this] { searchFrom(mPage->textCursor().selectionStart(), false); });
    resize(kSize);
    restoreGeometry(openSettings().value(placeKey()).toByteArray());
    owner->installEventFilter(this);
}

void HelpWindow::layOut() {
    auto* bar = new QToolBar(this);
    fillBar(*bar);
    auto* halves = new QSplitter(this);
    halves->addWidget(mContents);
    halves->addWidget(mPage);
    halves->setStretchFactor(0, 0);
    halves->setStretchFactor(1, 1);
    halves->setSizes({kContentsWidth, kSize.width() - kContentsWidth});
    halves->setChildrenCollapsible(false);
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addWidget(bar);
    layout->addWidget(halves, 1);
}

void HelpWindow::fillBar(QToolBar& bar) {
    initArtwork();
    const auto add = [&bar](const QIcon& icon, const QString& text, const QKeySequence& keys) {
        QAction* action = bar.addAction(icon, text);
        action->setShortcut(keys);
        action->setToolTip(withKeys(text, {keys}));
        return action;
    };
    QAction* back =
        add(style()->standardIcon(QStyle::SP_ArrowBack), tr("Back"), QKeySequence(Qt::ALT | Qt::Key_Left));
    QAction* forward = add(style()->standardIcon(QStyle::SP_ArrowForward), tr("Forward"),
                           QKeySequence(Qt::ALT | Qt::Key_Right));
    QAction* home = add(QIcon(QStringLiteral(":/Main UI/Help_24x24.png")), tr("First page"),
                        QKeySequence(Qt::ALT | Qt::Key_Home));
    for (QAction* action : {back, forward})
        action->setEnabled(false);
    connect(mPage, &HelpBrowser::backwardAvailable, back, &QAction::setEnabled);
    connect(mPage, &HelpBrowser::forwardAvailable, forward, &QAction::setEnabled);
    connect(back, &QAction::triggered, mPage, &HelpBrowser::backward);
    connect(forward, &QAction::triggered, mPage, &HelpBrowser::forward);
    connect(home, &QAction::triggered, this, [this] { mPage->setSource(HelpPages::pageOf({})); });

    auto* space = new QWidget(&bar);
    space->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Preferred);
    bar.addWidget(space);
    mMissing->setContentsMargins(0, 0, 8, 0);
    bar.addWidget(mMissing);
    bar.addWidget(mSearch);
    mSearch->setPlaceholderText(tr("Find on this page"));
    mSearch->setToolTip(withKeys(tr("Find on this page; the next place: %1 or %2, the one before: %3")
                                     .arg(nameOf(Qt::Key_Return), nameOf(kNextPlace), nameOf(kPlaceBefore)),
                                 {QKeySequence::Find}));
    mSearch->setClearButtonEnabled(true);
    mSearch->setMaximumWidth(kContentsWidth);
}

void HelpWindow::fillContents() {
    mContents->setHeaderHidden(true);
    mContents->setAccessibleName(tr("Contents"));
    QList<QTreeWidgetItem*> above; // the last one of every level
    for (const HelpPages::Heading& heading : HelpPages::contents()) {
        above.resize(std::min<qsizetype>(above.size(), heading.level - 1));
        auto* entry = new QTreeWidgetItem({heading.title});
        entry->setSizeHint(0, QSize(0, mContents->fontMetrics().height() + kRowSpace));
        entry->setData(0, kAddress, heading.address);
        if (above.isEmpty())
            mContents->addTopLevelItem(entry);
        else
            above.last()->addChild(entry);
        above.append(entry);
    }
}

void HelpWindow::addShortcuts() {
    const auto add = [this](const QKeySequence& keys, auto slot) {
        connect(new QShortcut(keys, this), &QShortcut::activated, this, slot);
    };
    add(QKeySequence::Find, [this] {
        mSearch->setFocus();
        mSearch->selectAll();
    });
    add(kNextPlace, [this] { searchOn(false); });
    add(kPlaceBefore, [this] { searchOn(true); });
    add(QKeySequence::ZoomIn, [this] { mPage->zoomIn(); });
    add(QKeySequence::ZoomOut, [this] { mPage->zoomOut(); });
    add(Qt::Key_Escape, [this] { leaveSearch(); });
    connect(mSearch, &QLineEdit::returnPressed, this, [this] { searchOn(false); });
}

void HelpWindow::openTopic(const QString& topic, QWidget* owner) {
    if (owner->window() != parentWidget())
        belongTo(owner->window());
    mPage->setSource(HelpPages::pageOf(topic));
    show();
    raise();
    activateWindow();
    mPage->setFocus();
}

void HelpWindow::belongTo(QWidget* owner) {
    const QRect place = geometry();
    const bool shown = isVisible();
    if (parentWidget())
        parentWidget()->removeEventFilter(this);
    setParent(owner, windowFlags());
    setEnabled(true); // it was disabled with the window before
    owner->installEventFilter(this);
    setGeometry(place);
    if (windowHandle()) // or the window manager would choose a place again, having chosen the first one
        windowHandle()->setGeometry(place);
    setVisible(shown);
}

// A message box is answered and gone; a window that offers help is one to read the manual beside.
void HelpWindow::followModalWindow() {
    QWidget* modal = QApplication::activeModalWidget();
    if (isVisible() && modal && modal != parentWidget() &&
        modal->findChild<QAbstractButton*>(QStringLiteral("btnHelp")))
        belongTo(modal);
}

void HelpWindow::leaveOwner() {
    QWidget* above = parentWidget()->parentWidget();
    if (above && above->window()->isVisible())
        belongTo(above->window());
    else if (isVisible()) // or it would store its place again
        close();
}

bool HelpWindow::event(QEvent* event) {
    if (event->type() == QEvent::WindowBlocked) // the modal window is not on the screen yet
        mFollow->start(0);
    return QWidget::event(event);
}

bool HelpWindow::eventFilter(QObject* watched, QEvent* event) {
    if (watched == parentWidget() && event->type() == QEvent::Hide && !event->spontaneous())
        leaveOwner();
    return QWidget::eventFilter(watched, event);
}

void HelpWindow::closeEvent(QCloseEvent* event) {
    SettingsEdit edit;
    edit.set(placeKey(), saveGeometry());
    StoreWriting::commit(edit, StoreWriting::Cause::Program);
    QWidget::closeEvent(event);
}

void HelpWindow::showEntry(const QTreeWidgetItem* entry) {
    if (entry)
        mPage->setSource(entry->data(0, kAddress).toUrl());
}

// Without going there: the page stands where the reader went.
void HelpWindow::markEntry(const QUrl& address) {
    const QSignalBlocker quiet(mContents);
    mContents->collapseAll();
    QTreeWidgetItem* here = nullptr;
    for (QTreeWidgetItemIterator entry(mContents); *entry; ++entry) {
        const QUrl leadsTo = (*entry)->data(0, kAddress).toUrl();
        if (leadsTo == address || (!here && leadsTo == address.adjusted(QUrl::RemoveFragment)))
            here = *entry;
    }
    if (!here)
        return;
    mContents->setCurrentItem(here);
    for (QTreeWidgetItem* entry = here; entry; entry = entry->parent())
        entry->setExpanded(true);
}

void HelpWindow::searchFrom(int position, bool backwards) {
    const QString text = mSearch->text();
    const bool found = text.isEmpty() || mPage->search(text, position, backwards);
    mMissing->setText(found ? QString() : tr("Not on this page"));
}

void HelpWindow::searchOn(bool backwards) {
    const QTextCursor at = mPage->textCursor();
    searchFrom(backwards ? at.selectionStart() : at.selectionEnd(), backwards);
}

void HelpWindow::leaveSearch() {
    if (mSearch->hasFocus())
        mPage->setFocus();
    else
        close();
}

void openHelp(const QString& topic, QWidget* owner) {
    static QPointer<HelpWindow> window;
    const QString compiled =
        QCoreApplication::applicationDirPath() + QLatin1String(HelpViewer::kCompiledManual);
    if (!QFile::exists(compiled))
        DebugBoxes::debugWarning(QStringLiteral("Help file missing:") + compiled, QStringLiteral("Warning"));
    else if (HelpViewer::show(std::bit_cast<void*>(owner->winId()),
                              (compiled + QStringLiteral("::/") + topic).toLocal8Bit().toStdString()))
        return;
    // A window over which a modal one stands is out of reach, and so would its help be.
    QWidget* reachable = QApplication::activeModalWidget() ? QApplication::activeModalWidget() : owner;
    if (!window)
        window = new HelpWindow(reachable);
    window->openTopic(topic, reachable);
}

} // namespace orvela
