#include "Utility/ErrorText.h"

#include <QCoreApplication>

namespace orvela {

QString ErrorText::english() const {
    return filled(QString::fromUtf8(mText));
}

QString ErrorText::shown() const {
    return filled(QCoreApplication::translate(mContext, mText));
}

// All places at once: a value may look like one.
QString ErrorText::filled(const QString& text) const {
    switch (mValues.size()) {
    case 0:
        return text;
    case 1:
        return text.arg(mValues[0]);
    case 2:
        return text.arg(mValues[0], mValues[1]);
    default:
        return text.arg(mValues.at(0), mValues.at(1), mValues.at(2));
    }
}

} // namespace orvela
