#include "metadata/XmpThumbnails.h"

#include "metadata/TagLibrary.h"

#include <QXmlStreamReader>

#include <vector>

namespace orvela {

namespace {

struct Element {
    qsizetype begin;
    qsizetype end;
};

bool isThumbnails(const QXmlStreamReader& reader) {
    return reader.name() == u"Thumbnails" && reader.namespaceUri() == u"http://ns.adobe.com/xap/1.0/";
}

// Behind the element whose beginning was read. @return whether there are others within
bool skip(QXmlStreamReader& reader) {
    bool full = false;
    for (int depth = 1; depth > 0 && !reader.atEnd();) {
        reader.readNext();
        full = full || reader.isStartElement();
        depth += reader.isStartElement() ? 1 : reader.isEndElement() ? -1 : 0;
    }
    return full;
}

// The elements that hold thumbnails, as far as the packet can be read.
std::vector<Element> thumbnailsIn(const QString& packet) {
    std::vector<Element> found;
    QXmlStreamReader reader(packet);
    while (!reader.atEnd()) {
        reader.readNext();
        if (!reader.isStartElement() || !isThumbnails(reader))
            continue;
        const qsizetype begin = packet.lastIndexOf('<', reader.characterOffset() - 1); // no value holds one
        if (skip(reader))
            found.push_back({begin, reader.characterOffset()});
    }
    return found;
}

} // namespace

ThumbnailsOfXmp takeThumbnails(Bytes& packet) {
    const QString before = QString::fromStdString(std::string(asText(packet)));
    const std::vector<Element> found = thumbnailsIn(before);
    if (found.empty())
        return ThumbnailsOfXmp::None;
    QString after;
    qsizetype from = 0;
    for (const Element& element : found) {
        after += before.mid(from, element.begin - from);
        from = element.end;
    }
    after += before.mid(from);
    const std::string kept = after.toStdString();
    const ByteView bytes = asBytes(kept);
    const bool exact = asText(packet) == before.toStdString();
    if (!exact || !thumbnailsIn(after).empty() || !isWellFormedXmp(bytes))
        return ThumbnailsOfXmp::Kept;
    packet = copyOf(bytes);
    return ThumbnailsOfXmp::Taken;
}

} // namespace orvela
