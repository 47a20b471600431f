#include "GUI/Windows/HelpPages.h"

#include "Settings/SliderTable.h"

#include <QDirIterator>
#include <QFile>
#include <QRegularExpression>
#include <QSet>
#include <QTextBlock>
#include <QTextDocument>

#include <gtest/gtest.h>

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

// Of the sections whose headings name the slider, with what stands below them.
QString textAbout(const QString& label, const QTextDocument& page) {
    QString text;
    bool here = false;
    for (QTextBlock block = page.begin(); block.isValid(); block = block.next()) {
        if (block.blockFormat().headingLevel() > 0)
            here = QRegularExpression(QStringLiteral("\\b%1(?! I)\\b").arg(QRegularExpression::escape(label)))
                       .match(block.text())
                       .hasMatch();
        if (here)
            text += block.text() + QLatin1Char('\n');
    }
    return text;
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

TEST(HelpPages, DescribeEverySliderWithItsRange) {
    const auto main = pageAt(HelpPages::pageOf(QStringLiteral("advancedenhancementoptions.htm")));
    const auto touch = pageAt(HelpPages::pageOf(QStringLiteral("finaltouch.htm")));
    for (const SliderDescription& slider : SliderTable::sliders()) {
        const QString label = QString::fromUtf8(slider.label);
        const QString text = textAbout(label, slider.stage == SettingStage::Main ? *main : *touch);
        EXPECT_FALSE(text.isEmpty()) << slider.label << " has no section";
        if (!slider.value) // a switch
            continue;
        const QRegularExpression range(QStringLiteral("(^|[^\\d.])%1 (down )?to %2([^\\d.]|\\.?\\s|$)")
                                           .arg(slider.scale->low())
                                           .arg(slider.scale->high()));
        EXPECT_TRUE(range.match(text).hasMatch())
            << slider.label << " lacks " << qPrintable(range.pattern()) << " in\n"
            << qPrintable(text);
    }
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
