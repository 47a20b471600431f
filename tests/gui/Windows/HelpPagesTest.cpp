#include "GUI/Windows/HelpPages.h"

#include "Settings/ModeTable.h"
#include "Settings/PaneTable.h"

#include <QDirIterator>
#include <QFile>
#include <QMap>
#include <QRegularExpression>
#include <QSet>
#include <QTextBlock>
#include <QTextDocument>

#include <gtest/gtest.h>

#include <algorithm>
#include <memory>

using namespace orvela;

namespace {

std::unique_ptr<QTextDocument> pageAt(const QUrl& address) {
    QFile file(QLatin1Char(':') + address.path());
    EXPECT_TRUE(file.open(QFile::ReadOnly)) << qPrintable(address.toString());
    auto page = std::make_unique<QTextDocument>();
    page->setHtml(QString::fromUtf8(file.readAll()));
    return page;
}

/// Where a page states the range of a slider: at the beginning of a paragraph under a heading of its label,
/// or in a row of a table that names it.
QStringList statementsAbout(const QString& label, const QTextDocument& page) {
    static const QRegularExpression link(QStringLiteral("\\[([^]]*)\\]\\([^)]*\\)"));
    static const QRegularExpression range(
        QStringLiteral("^((Perceptual|Absolute), )?-?\\d[\\d.]* (down )?to "));
    const QRegularExpression named(
        QStringLiteral("\\| *%1(, -?\\d| *\\|)").arg(QRegularExpression::escape(label)));
    QString text = page.toMarkdown().remove('*').replace(link, "\\1");
    text.replace("\n|", "\n\n|"); // each row of a table by itself, as a paragraph is
    QStringList found;
    QString heading;
    for (const QString& part : text.split("\n\n", Qt::SkipEmptyParts)) {
        const bool isRow = part.startsWith('|');
        if (part.startsWith('#'))
            heading = part.section(' ', 1);
        else if (isRow ? named.match(part).hasMatch() : heading == label && range.match(part).hasMatch())
            found.append(part);
    }
    return found;
}

bool tellsRange(const QString& statement, const SliderScale& scale) {
    return QRegularExpression(QStringLiteral("(^|[^\\d.-])%1 (down )?to %2([^\\d.]|\\.?\\s|$)")
                                  .arg(scale.low())
                                  .arg(scale.high()))
        .match(statement)
        .hasMatch();
}

struct Links {
    QSet<QUrl> leadTo;
    QSet<QString> anchors;
};

Links linksOf(const QUrl& address) {
    Links links;
    const auto page = pageAt(address);
    for (QTextBlock block = page->begin(); block.isValid(); block = block.next()) {
        for (auto it = block.begin(); !it.atEnd(); ++it) {
            const QTextCharFormat format = it.fragment().charFormat();
            for (const QString& name : format.anchorNames())
                links.anchors.insert(name);
            if (!format.anchorHref().isEmpty())
                links.leadTo.insert(address.resolved(QUrl(format.anchorHref())));
            if (format.isImageFormat())
                links.leadTo.insert(address.resolved(QUrl(format.toImageFormat().name())));
        }
    }
    return links;
}

} // namespace

// By the page that the window of the mode opens.
TEST(HelpPages, TellTheRangeOfEverySliderAndNoOther) {
    const auto pageNameOf = [](EGUIMode mode) {
        switch (mode) {
        case Mode_Adjustments:
            return "adjustments.htm";
        case Mode_AddIllumination:
            return "illumination.htm";
        case Mode_Advanced:
            return "advancedenhancementoptions.htm";
        case Mode_FinalTouch:
            return "finaltouch.htm";
        default:
            return "allfilterfunctions.htm";
        }
    };
    int asked = 0;
    for (const ModeDescription& mode : ModeTable::all()) {
        if (mode.presetName || PaneTable::sliders(mode.mode).empty())
            continue;
        const auto page = pageAt(HelpPages::pageOf(QLatin1String(pageNameOf(mode.mode))));
        QMap<QString, QSet<const SliderScale*>> scales; // perceptual and absolute sliders share their labels
        for (const PaneSlider& each : PaneTable::sliders(mode.mode))
            if (each.slider.value)
                scales[QString::fromUtf8(each.slider.label)].insert(each.slider.scale);
        for (auto [label, ofLabel] : scales.asKeyValueRange()) {
            const QStringList statements = statementsAbout(label, *page);
            for (const SliderScale* scale : ofLabel)
                EXPECT_TRUE(std::any_of(statements.begin(), statements.end(),
                                        [&](const QString& each) { return tellsRange(each, *scale); }))
                    << mode.displayName << ": " << qPrintable(label) << " is not told from " << scale->low()
                    << " to " << scale->high() << " in\n"
                    << qPrintable(statements.join('\n'));
            for (const QString& each : statements)
                EXPECT_TRUE(std::any_of(ofLabel.begin(), ofLabel.end(),
                                        [&](const SliderScale* scale) { return tellsRange(each, *scale); }))
                    << mode.displayName << ": " << qPrintable(label)
                    << " has no such range: " << qPrintable(each);
            ++asked;
        }
    }
    EXPECT_GE(asked, 40);
}

TEST(HelpPages, LeadToPagesSectionsAndPicturesThatAreThere) {
    QHash<QUrl, Links> pages;
    for (const HelpPages::Heading& heading : HelpPages::contents())
        if (heading.level == 1)
            pages.insert(heading.address, linksOf(heading.address));
    EXPECT_EQ(pages.size(), 7);

    QSet<QUrl> used;
    for (const Links& links : pages)
        used.unite(links.leadTo);
    for (const HelpPages::Heading& heading : HelpPages::contents())
        used.insert(heading.address);
    for (const QUrl& url : used) {
        EXPECT_TRUE(QFile::exists(QLatin1Char(':') + url.path())) << qPrintable(url.toString());
        if (url.hasFragment()) {
            EXPECT_TRUE(pages.value(url.adjusted(QUrl::RemoveFragment)).anchors.contains(url.fragment()))
                << qPrintable(url.toString());
        }
    }
    for (QDirIterator it(QStringLiteral(":/manual/pictures")); it.hasNext();)
        EXPECT_TRUE(used.contains(QUrl(QStringLiteral("qrc") + it.next()))) << qPrintable(it.filePath());
}

TEST(HelpPages, HaveEveryTopicThatTheProgramNames) {
    static const QRegularExpression topic(QStringLiteral("\"(\\w+\\.htm)\""));
    QSet<QString> named;
    for (QDirIterator it(QStringLiteral(ORVELA_SOURCES), {QStringLiteral("*.cpp")}, QDir::Files,
                         QDirIterator::Subdirectories);
         it.hasNext();) {
        QFile source(it.next());
        ASSERT_TRUE(source.open(QFile::ReadOnly));
        const QString text = QString::fromUtf8(source.readAll());
        for (auto match = topic.globalMatch(text); match.hasNext();)
            named.insert(match.next().captured(1));
    }
    EXPECT_GE(named.size(), 7);
    for (const QString& name : named)
        EXPECT_TRUE(HelpPages::pageOf(name).path().endsWith(name)) << qPrintable(name);
    EXPECT_EQ(HelpPages::pageOf(QStringLiteral("Unknown mode")),
              HelpPages::pageOf(QStringLiteral("welcome.htm")));
}
