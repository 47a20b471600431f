#include "GUI/Windows/HelpPages.h"

#include <QFile>
#include <QTextBlock>
#include <QTextDocument>

#include <algorithm>

// The macro declares a function of the namespace that it stands in, and the resource's is in none.
static void initManual() {
    Q_INIT_RESOURCE(manual);
}

namespace orvela {

namespace {

// The order of the manual.
constexpr const char* kTopics[] = {
    "welcome.htm",
    "adjustments.htm",
    "illumination.htm",
    "allfilterfunctions.htm",
    "advancedenhancementoptions.htm",
    "finaltouch.htm",
    "presetandcustomfilters.htm",
};

QString fileOf(const QString& topic) {
    return QStringLiteral(":/manual/") + topic;
}

QUrl addressOf(const QString& topic) {
    return QUrl(QStringLiteral("qrc:/manual/") + topic);
}

QString anchorOf(const QTextBlock& heading) {
    return heading.begin().fragment().charFormat().anchorNames().value(0);
}

void appendHeadings(const QString& topic, QList<HelpPages::Heading>& headings) {
    QFile file(fileOf(topic));
    if (!file.open(QFile::ReadOnly))
        return;
    QTextDocument text;
    text.setHtml(QString::fromUtf8(file.readAll()));
    for (QTextBlock block = text.begin(); block.isValid(); block = block.next()) {
        const int level = block.blockFormat().headingLevel();
        if (level == 0)
            continue;
        QUrl address = addressOf(topic);
        if (level > 1)
            address.setFragment(anchorOf(block));
        headings.append({block.text(), address, level});
    }
}

} // namespace

namespace HelpPages {

QUrl pageOf(const QString& topic) {
    const bool known = std::find(std::begin(kTopics), std::end(kTopics), topic) != std::end(kTopics);
    return addressOf(known ? topic : QLatin1String(kTopics[0]));
}

QList<Heading> contents() {
    initManual();
    QList<Heading> headings;
    for (const char* topic : kTopics)
        appendHeadings(QLatin1String(topic), headings);
    return headings;
}

} // namespace HelpPages

} // namespace orvela
