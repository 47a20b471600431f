// Renders the drawings listed in a file to pictures at one and two device pixels per pixel and writes the
// resource collection that names them; or one drawing to a square picture of a size. Runs while Orvela is
// built.

#include <QDir>
#include <QFile>
#include <QImage>
#include <QPainter>
#include <QSvgRenderer>
#include <QTextStream>

#include <cstdio>

namespace {

bool render(QSvgRenderer& renderer, const QSize& size, const QString& picture) {
    if (!renderer.isValid())
        return false;
    QImage image(size, QImage::Format_ARGB32_Premultiplied);
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
    QSvgRenderer renderer(drawings.filePath(name + QStringLiteral(".svg")));
    for (int scale : {1, 2}) {
        const QString suffix = scale == 1 ? QStringLiteral(".png") : QStringLiteral("@2x.png");
        if (!render(renderer, renderer.defaultSize() * scale, pictures.filePath(name + suffix)))
            return false;
        for (const QString& path : line.section(QLatin1Char(':'), 1).split(QLatin1Char('|')))
            addEntry(collection, path.trimmed() + suffix, name + suffix);
    }
    return true;
}

int renderList(const QString& listed, const QString& folder) {
    QFile list(listed);
    const QDir drawings = QFileInfo(list).absoluteDir();
    const QDir pictures(folder);
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

int renderIcon(const QString& drawing, int size, const QString& picture) {
    QSvgRenderer renderer(drawing);
    if (size > 0 && render(renderer, {size, size}, picture))
        return 0;
    std::fprintf(stderr, "render_artwork: cannot render \"%s\"\n", qPrintable(drawing));
    return 1;
}

} // namespace

int main(int argc, char** argv) {
    const auto argument = [argv](int i) { return QString::fromLocal8Bit(argv[i]); };
    if (argc == 3)
        return renderList(argument(1), argument(2));
    if (argc == 4)
        return renderIcon(argument(1), argument(2).toInt(), argument(3));
    std::fputs("usage: render_artwork LIST OUTPUT-FOLDER, or render_artwork DRAWING SIZE PICTURE\n", stderr);
    return 2;
}
