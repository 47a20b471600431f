#pragma once

#include "GUI/Windows/PreviewWindow.h"
#include "GUI/forms/ui_CDlgSinglePreview.h"

/// One of the two split preview windows: its horizontal layout takes one view.
class CDlgSinglePreviewImpl final : public orvela::PreviewWindow, public Ui::CDlgSinglePreview {
    Q_OBJECT

public:
    explicit CDlgSinglePreviewImpl(QWidget* parent);
};
