#include "GUI/Windows/Translations.h"

#include <QCoreApplication>
#include <QDir>
#include <QLibraryInfo>
#include <QTranslator>

#include <memory>

// The macro declares a function of the namespace that it stands in, and the resource's is in none.
static void initResource() {
    Q_INIT_RESOURCE(translations);
}

namespace orvela {

namespace Translations {

namespace {

const QString kFolder = QStringLiteral(":/orvela/translations");

// The toolkit's own texts, such as the buttons of message boxes, come from its own catalogue.
struct Catalogues {
    QTranslator toolkit;
    QTranslator windows;
};

std::unique_ptr<Catalogues>& installed() {
    static std::unique_ptr<Catalogues> catalogues;
    return catalogues;
}

QString chosenLanguage(const QLocale& locale) {
    const QStringList known = languages();
    for (const QString& wanted : locale.uiLanguages()) {
        QString language = wanted.section(QLatin1Char('-'), 0, 0);
        if (language == QLatin1String("en") || known.contains(language))
            return language;
    }
    return QStringLiteral("en");
}

} // namespace

QString install(const QLocale& locale, Texts texts) {
    initResource();
    remove();
    QString language = chosenLanguage(locale);
    if (language == QLatin1String("en"))
        return language;
    auto catalogues = std::make_unique<Catalogues>();
    if (!catalogues->windows.load(QStringLiteral("orvela_") + language, kFolder))
        return QStringLiteral("en"); // and not the toolkit's buttons in another language than the windows
    if (texts == WithToolkit && catalogues->toolkit.load(QStringLiteral("qtbase_") + language,
                                                         QLibraryInfo::path(QLibraryInfo::TranslationsPath)))
        QCoreApplication::installTranslator(&catalogues->toolkit);
    QCoreApplication::installTranslator(&catalogues->windows);
    installed() = std::move(catalogues);
    return language;
}

void remove() {
    installed().reset(); // what is destroyed is no longer asked
}

QStringList languages() {
    initResource();
    QStringList languages;
    for (const QString& file : QDir(kFolder).entryList({QStringLiteral("orvela_*.qm")}))
        languages.append(file.section(QLatin1Char('_'), 1).section(QLatin1Char('.'), 0, 0));
    return languages;
}

QString modeName(EGUIMode mode) {
    return QCoreApplication::translate("ModeTable", getModeAsString(mode).toUtf8().constData());
}

QString stepTitle(const char* title) {
    return title ? QCoreApplication::translate("PipelineTable", title) : QString();
}

// What memory was wanted for is of no use to who waits for the picture.
QString causeOf(const Failure& failure) {
    return failure.outOfMemory
               ? QCoreApplication::translate(
                     "Failure", "there is not enough memory; close other programs or take a smaller picture")
               : QCoreApplication::translate("Failure", failure.cause.toUtf8().constData());
}

} // namespace Translations

} // namespace orvela
