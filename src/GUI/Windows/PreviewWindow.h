#pragma once

#include <QWidget>

namespace orvela {

/// A window that stays above its owner's and that only the owner shows and hides: closing it is refused.
class PreviewWindow : public QWidget {
    Q_OBJECT

public:
    /// Hidden at first.
    explicit PreviewWindow(QWidget* owner);

protected:
    void closeEvent(QCloseEvent* event) override;
};

} // namespace orvela
