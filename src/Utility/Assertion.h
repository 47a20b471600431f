#pragma once

#include "Utility/CGenericEx.h"

#include <QtGlobal>

namespace orvela {

/// A promise that our own code keeps. Where it does not hold, builds with assertions end with Qt's assertion
/// message; others throw, so that no host is ever ended by us.
/// @param where, what, file, line  as the message shows them
/// @throws CGenericEx with the text `what`
inline void require(bool holds, const char* where, const char* what, const char* file, int line) {
    if (holds)
        return;
#if defined(QT_NO_DEBUG) && !defined(QT_FORCE_ASSERTS)
    Q_UNUSED(where);
    throw CGenericEx(QString::fromLatin1(what), file, line);
#else
    qt_assert_x(where, what, file, line);
#endif
}

} // namespace orvela
