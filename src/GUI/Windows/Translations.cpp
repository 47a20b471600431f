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

const QString kFolder = QStringLiteral(":/translations");

// The toolkit's own texts, such as the buttons of message boxes, come from its own catalogue.
struct Catalogues {
    QTranslator toolkit;
    QTranslator windows;
};

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

QString install(const QLocale& locale) {
    static std::unique_ptr<Catalogues> installed;
    initResource();
    installed.reset(); // takes the translators away
    QString language = chosenLanguage(locale);
    if (language == QLatin1String("en"))
        return language;
    installed = std::make_unique<Catalogues>();
    if (installed->toolkit.load(QStringLiteral("qtbase_") + language,
                                QLibraryInfo::path(QLibraryInfo::TranslationsPath)))
        QCoreApplication::installTranslator(&installed->toolkit);
    if (installed->windows.load(QStringLiteral("orvela_") + language, kFolder))
        QCoreApplication::installTranslator(&installed->windows);
    return language;
}

QStringList languages() {
    initResource();
    QStringList languages;
    for (const QString& file : QDir(kFolder).entryList())
        languages.append(file.section(QLatin1Char('_'), 1).section(QLatin1Char('.'), 0, 0));
    return languages;
}

QString modeName(EGUIMode mode) {
    return QCoreApplication::translate("ModeTable", getModeAsString(mode).toUtf8().constData());
}

QString stepTitle(const char* title) {
    return title ? QCoreApplication::translate("PipelineTable", title) : QString();
}

} // namespace Translations

} // namespace orvela
