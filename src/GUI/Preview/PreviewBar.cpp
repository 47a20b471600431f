#include "GUI/Preview/PreviewBar.h"

#include "GUI/Preview/HistogramView.h"

#include <QGridLayout>
#include <QLabel>
#include <QToolButton>

namespace orvela {

PreviewBar::PreviewBar(QWidget* parent) : QWidget(parent) {
    auto* layout = new QGridLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    mHistogram = new HistogramView;
    layout->addWidget(mHistogram, 0, 0, 4, 1);
    const QList<QToolButton*> buttons = {
        addButton(tr("Fit"), tr("Show the whole width of the picture (Ctrl+0).")),
        addButton(tr("1:1"), tr("Show every pixel of the picture as one of the screen (Ctrl+1).")),
        addButton(tr("Compare"),
                  tr("Draw a line across the processed picture, left of which the original is "
                     "seen (F3). Hold the space bar over the pictures, or F2, to see the whole "
                     "original."))};
    for (int row = 0; row < buttons.size(); ++row)
        layout->addWidget(buttons[row], row, 1);
    mCompare = buttons.last();
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
    connect(buttons[0], &QToolButton::clicked, this, &PreviewBar::fitRequested);
    connect(buttons[1], &QToolButton::clicked, this, &PreviewBar::pixelsRequested);
    connect(mCompare, &QToolButton::toggled, this, &PreviewBar::comparingChanged);
}

QToolButton* PreviewBar::addButton(const QString& text, const QString& help) {
    auto* button = new QToolButton;
    button->setText(text);
    button->setToolTip(help);
    button->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Preferred);
    button->setAutoRaise(true);
    return button;
}

void PreviewBar::setDraft(bool draft) {
    mDraft->setVisible(draft);
}

void PreviewBar::setComparing(bool comparing) {
    mCompare->setChecked(comparing);
}

} // namespace orvela
