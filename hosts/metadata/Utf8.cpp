#include "metadata/Utf8.h"

#include <QString>
#include <QStringDecoder>

namespace orvela {

std::string latinToUtf8(ByteView latin) {
    return QString::fromLatin1(reinterpret_cast<const char*>(latin.data()),
                               static_cast<qsizetype>(latin.size()))
        .toStdString();
}

std::string toUtf8(const std::string& bytes) {
    QStringDecoder decoder(QStringDecoder::Utf8);
    const QString text = decoder.decode(QByteArrayView(bytes.data(), static_cast<qsizetype>(bytes.size())));
    return decoder.hasError() ? latinToUtf8(asBytes(bytes)) : text.toStdString();
}

} // namespace orvela
