// Writes pictures of every control, pane or small window, or of the windows in every layout, to a folder:
//     gui_screenshots controls|panes|windows FOLDER SUFFIX light|dark LANGUAGE
//     gui_screenshots layouts FOLDER SUFFIX light|dark LANGUAGE PHOTO
// The scale is that of the environment variable QT_SCALE_FACTOR; the suffix tells the variants apart. Layouts
// need a screen with a window manager. scripts/screenshots runs it.

#include "GUI/Controls/Artwork.h"
#include "GUI/Windows/Translations.h"
#include "LayoutScreenshots.h"
#include "Shots.h"
#include "Utility/CARGBPlane.h"

#include <QApplication>
#include <QTemporaryDir>

#include <cstdio>

using namespace orvela;

namespace {

constexpr char kUsage[] = "usage: gui_screenshots controls|panes|windows FOLDER SUFFIX light|dark LANGUAGE\n"
                          "       gui_screenshots layouts FOLDER SUFFIX light|dark LANGUAGE PHOTO\n";

QPalette darkPalette() {
    QPalette dark(QColor(53, 53, 53));
    dark.setColor(QPalette::Base, QColor(35, 35, 35));
    dark.setColor(QPalette::Highlight, QColor(42, 130, 218));
    dark.setColor(QPalette::Link, QColor(90, 170, 240));
    for (auto role : {QPalette::WindowText, QPalette::Text, QPalette::ButtonText})
        dark.setColor(QPalette::Disabled, role, QColor(140, 140, 140));
    return dark;
}

std::vector<Shot> shotsOf(const QString& group, CARGBPlane& plane) {
    if (group == QLatin1String("panes"))
        return paneShots();
    return group == QLatin1String("windows") ? windowShots() : controlShots(plane);
}

bool save(QWidget& widget, const QString& path) {
    widget.show();
    widget.activateWindow();
    QCoreApplication::processEvents();
    const bool saved = widget.grab().save(path);
    if (!saved)
        std::fprintf(stderr, "gui_screenshots: cannot write %s\n", qPrintable(path));
    return saved;
}

} // namespace

int main(int argc, char** argv) {
    const QTemporaryDir settings; // nobody's own settings are touched
    qputenv("XDG_CONFIG_HOME", settings.path().toLocal8Bit());
    QApplication application(argc, argv);
    const QStringList arguments = QCoreApplication::arguments();
    if (arguments.size() < 6) {
        std::fputs(kUsage, stderr);
        return 2;
    }
    if (arguments[4] == QLatin1String("dark"))
        QApplication::setPalette(darkPalette());
    QApplication::setStyle(QStringLiteral("Fusion"));
    Translations::install(QLocale(arguments[5]));
    initArtwork();
    if (arguments[1] == QLatin1String("layouts"))
        return takeLayouts(arguments.value(6), arguments[2], arguments[3]) ? 0 : 1;
    CARGBPlane plane(240, 160, QStringLiteral("preview"));
    bool saved = true;
    for (auto& [name, widget] : shotsOf(arguments[1], plane)) {
        const QString file = QString::fromStdString(name) + QLatin1Char('-') + arguments[3];
        saved = save(*widget, QStringLiteral("%1/%2.png").arg(arguments[2], file)) && saved;
    }
    return saved ? 0 : 1;
}
