#pragma once

#include <QList>
#include <QString>
#include <QUrl>

namespace orvela {

/// The pages of the manual, compiled into the program.
namespace HelpPages {

/// A heading of the manual.
struct Heading {
    QString title;
    QUrl address; ///< the page, with the anchor of the heading where it is not the page's own
    int level;    ///< 1 for a page, more for what lies below the heading before
};

/// The page of a topic such as "welcome.htm"; the first page for a topic that the manual does not have.
QUrl pageOf(const QString& topic);

/// The table of contents, page after page.
QList<Heading> contents();

} // namespace HelpPages

} // namespace orvela
