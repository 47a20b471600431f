#pragma once

#include "GUI/Windows/PreviewWindow.h"
#include "GUI/forms/ui_CDlgDualPreview.h"

/// The joined preview window: its horizontal layout takes the view of the original and, beside it, that of
/// the processed picture.
class CDlgDualPreviewImpl final : public orvela::PreviewWindow, public Ui::CDlgDualPreview {
    Q_OBJECT

public:
    explicit CDlgDualPreviewImpl(QWidget* parent);
};
