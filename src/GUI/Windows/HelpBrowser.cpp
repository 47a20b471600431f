#include "GUI/Windows/HelpBrowser.h"

#include <QEvent>
#include <QFile>
#include <QRegularExpression>
#include <QScrollBar>

namespace orvela {

HelpBrowser::HelpBrowser(QWidget* parent) : QTextBrowser(parent) {
    setOpenExternalLinks(true);
    document()->setDocumentMargin(20);
}

bool HelpBrowser::search(const QString& text, int position, bool backwards) {
    const auto flags = backwards ? QTextDocument::FindBackward : QTextDocument::FindFlags();
    QTextCursor found = document()->find(text, position, flags);
    if (found.isNull())
        found = document()->find(text, backwards ? document()->characterCount() - 1 : 0, flags);
    if (found.isNull())
        return false;
    setTextCursor(found);
    ensureCursorVisible();
    return true;
}

bool HelpBrowser::isDark() const {
    return palette().color(QPalette::Base).lightness() < palette().color(QPalette::Text).lightness();
}

// What the pages leave to the one who shows them.
QByteArray HelpBrowser::paletteStyle() const {
    return QStringLiteral("body { color: %1; background-color: %2; font-family: '%3'; margin: 0px; }")
        .arg(palette().color(QPalette::Text).name(), palette().color(QPalette::Base).name(), font().family())
        .toUtf8();
}

QVariant HelpBrowser::loadResource(int type, const QUrl& name) {
    QByteArray resource = QTextBrowser::loadResource(type, name).toByteArray();
    if (type == QTextDocument::HtmlResource) {
        // The table of contents beside the page leads to the other pages.
        static const QRegularExpression topics(QStringLiteral("<p class=\"topics\">.*</p>"));
        return QString::fromUtf8(resource).remove(topics);
    }
    if (type != QTextDocument::StyleSheetResource)
        return resource;
    QFile dark(QStringLiteral(":/manual/manual-dark.css"));
    if (isDark() && dark.open(QFile::ReadOnly))
        resource += dark.readAll();
    return resource + paletteStyle();
}

void HelpBrowser::changeEvent(QEvent* event) {
    QTextBrowser::changeEvent(event);
    if (event->type() != QEvent::PaletteChange || source().isEmpty())
        return;
    const int place = verticalScrollBar()->value();
    document()->clear(); // with what it keeps of the style
    reload();
    verticalScrollBar()->setValue(place);
}

} // namespace orvela
