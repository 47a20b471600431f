// Renders the drawings listed in a file to pictures at one and two device pixels per pixel and writes the
// resource collection that names them. Runs while Orvela is built.

#include <QDir>
#include <QFile>
#include <QImage>
#include <QPainter>
#include <QSvgRenderer>
#include <QTextStream>

#include <cstdio>

namespace {

bool render(const QString& drawing, int scale, const QString& picture) {
    QSvgRenderer renderer(drawing);
    if (!renderer.isValid())
        return false;
    QImage image(renderer.defaultSize() * scale, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    renderer.render(&painter);
    painter.end();
    return image.save(picture);
}

void addEntry(QTextStream& collection, const QString& path, const QString& picture) {
    collection << "  <file alias=\"" << path.toHtmlEscaped() << "\">" << picture.toHtmlEscaped()
               << "</file>\n";
}

// One line of the list: "drawing : path | path". False when the drawing cannot be rendered.
bool renderLine(const QString& line, const QDir& drawings, const QDir& pictures, QTextStream& collection) {
    const QString name = line.section(QLatin1Char(':'), 0, 0).trimmed();
    for (int scale : {1, 2}) {
        const QString suffix = scale == 1 ? QStringLiteral(".png") : QStringLiteral("@2x.png");
        if (!render(drawings.filePath(name + QStringLiteral(".svg")), scale,
                    pictures.filePath(name + suffix)))
            return false;
        for (const QString& path : line.section(QLatin1Char(':'), 1).split(QLatin1Char('|')))
            addEntry(collection, path.trimmed() + suffix, name + suffix);
    }
    return true;
}

} // namespace

int main(int argc, char** argv) {
    if (argc != 3) {
        std::fputs("usage: render_artwork LIST OUTPUT-FOLDER\n", stderr);
        return 2;
    }
    QFile list(QString::fromLocal8Bit(argv[1]));
    const QDir drawings = QFileInfo(list).absoluteDir();
    const QDir pictures(QString::fromLocal8Bit(argv[2]));
    QFile file(pictures.filePath(QStringLiteral("artwork.qrc")));
    if (!list.open(QIODevice::ReadOnly | QIODevice::Text) || !pictures.mkpath(QStringLiteral(".")) ||
        !file.open(QIODevice::WriteOnly)) {
        std::fputs("render_artwork: the list cannot be read or the output folder cannot be written\n",
                   stderr);
        return 1;
    }
    QTextStream collection(&file);
    collection << "<RCC><qresource prefix=\"/\">\n";
    for (const QString& line :
         QString::fromUtf8(list.readAll()).split(QLatin1Char('\n'), Qt::SkipEmptyParts)) {
        if (line.startsWith(QLatin1Char('#')))
            continue;
        if (!renderLine(line, drawings, pictures, collection)) {
            std::fprintf(stderr, "render_artwork: cannot render \"%s\"\n", qPrintable(line));
            return 1;
        }
    }
    collection << "</qresource></RCC>\n";
    return 0;
}
