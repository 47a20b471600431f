#include "Platform/HelpViewer.h"

#include <QCoreApplication>

namespace orvela {

QString HelpViewer::compiledManual() {
    return QCoreApplication::applicationDirPath() +
           QStringLiteral("\\Plug-Ins\\Kestrand\\Help\\OrvelaManual.chm");
}

} // namespace orvela
