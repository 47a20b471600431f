#include "GUI/Preview/PreviewBar.h"

#include "GUI/Controls/KeyTips.h"
#include "GUI/Preview/HistogramView.h"

#include <QAction>
#include <QGridLayout>
#include <QLabel>
#include <QToolButton>

namespace orvela {

namespace {

QToolButton* buttonOf(const QString& text) {
    auto* button = new QToolButton;
    button->setText(text);
    button->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Preferred);
    return button;
}

} // namespace

PreviewBar::PreviewBar(QWidget* parent) : QWidget(parent) {
    auto* layout = new QGridLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    mHistogram = new HistogramView;
    layout->addWidget(mHistogram, 0, 0, 4, 1);
    mFit = buttonOf(tr("Fit"));
    mPixels = buttonOf(tr("1:1"));
    mCompare = buttonOf(tr("Compare"));
    layout->addWidget(mFit, 0, 1);
    layout->addWidget(mPixels, 1, 1);
    layout->addWidget(mCompare, 2, 1);
    mCompare->setCheckable(true);
    mDraft = new QLabel(tr("Draft"));
    mDraft->setAlignment(Qt::AlignCenter);
    mDraft->setToolTip(tr("A quick look while a slider moves. The exact picture follows."));
    QSizePolicy keeps = mDraft->sizePolicy();
    keeps.setRetainSizeWhenHidden(true);
    mDraft->setSizePolicy(keeps);
    mDraft->hide();
    layout->addWidget(mDraft, 3, 1);
    layout->setColumnStretch(0, 1);
    connect(mFit, &QToolButton::clicked, this, &PreviewBar::fitRequested);
    connect(mPixels, &QToolButton::clicked, this, &PreviewBar::pixelsRequested);
    connect(mCompare, &QToolButton::toggled, this, &PreviewBar::comparingChanged);
}

void PreviewBar::setDraft(bool draft) {
    mDraft->setVisible(draft);
}

void PreviewBar::tellKeys(const QList<QAction*>& keys, const QKeySequence& hold) {
    mFit->setToolTip(withKeys(tr("Show the whole width of the picture."), keys.at(0)->shortcuts()));
    mPixels->setToolTip(
        withKeys(tr("Show every pixel of the picture as one of the screen."), keys.at(1)->shortcuts()));
    const QString compare =
        tr("Draw a line across the processed picture, left of which the original is seen; "
           "%1 and %2 move it. Hold the space bar over the pictures, or %3, to see the whole "
           "original.")
            .arg(nameOf(keys.at(3)->shortcut()), nameOf(keys.at(4)->shortcut()), nameOf(hold));
    mCompare->setToolTip(withKeys(compare, keys.at(2)->shortcuts()));
}

void PreviewBar::setComparing(bool comparing) {
    mCompare->setChecked(comparing);
}

} // namespace orvela
