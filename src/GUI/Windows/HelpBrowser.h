#pragma once

#include <QTextBrowser>

namespace orvela {

/// Shows pages of the manual in the colours of its palette, and anew when the palette changes.
class HelpBrowser : public QTextBrowser {
    Q_OBJECT

public:
    explicit HelpBrowser(QWidget* parent = nullptr);

    /// Selects the first place of `text` from the character at `position` on, or before it when searching
    /// backwards, and goes on from the other end. False where the page does not have it.
    bool search(const QString& text, int position, bool backwards);

protected:
    QVariant loadResource(int type, const QUrl& name) override;
    void changeEvent(QEvent* event) override;

private:
    bool isDark() const;
    QByteArray paletteStyle() const;
};

} // namespace orvela
