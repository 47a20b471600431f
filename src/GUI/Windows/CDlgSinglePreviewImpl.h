#pragma once

#include "GUI/forms/ui_CDlgSinglePreview.h"

#include <QDialog>

/// One of the two windows that show the original and the processed picture apart. It comes and goes with the
/// processing window; its own close button does nothing.
class CDlgSinglePreviewImpl : public QDialog, private Ui::CDlgSinglePreview {
    Q_OBJECT

public:
    explicit CDlgSinglePreviewImpl(QWidget* parent = nullptr);

    /// Takes a view in, on the right of those that are there.
    void addView(QWidget* view);
    /// Takes in what stands below the views.
    void addBelow(QWidget* widget);

public Q_SLOTS:
    /// Does nothing either: the Escape key.
    void reject() override {}

protected:
    void closeEvent(QCloseEvent* event) override;
};
