#pragma once

#include "GUI/forms/ui_CDlgDualPreview.h"

#include <QDialog>

/// The window that shows the original and the processed picture side by side. It comes and goes with the
/// processing window; its own close button does nothing.
class CDlgDualPreviewImpl : public QDialog, private Ui::CDlgDualPreview {
    Q_OBJECT

public:
    explicit CDlgDualPreviewImpl(QWidget* parent = nullptr);

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
