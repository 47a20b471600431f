#pragma once

#include <QAbstractButton>
#include <QApplication>
#include <QMessageBox>
#include <QPushButton>
#include <QTimer>

#include <gtest/gtest.h>

namespace orvela {

/// Presses a button of the next message box. `said` becomes the box's "title|text", and "|button" where one
/// of several is the default.
inline void answerBox(QMessageBox::StandardButton button, QString& said) {
    QTimer::singleShot(0, qApp, [button, &said] {
        const auto* shown = qobject_cast<QMessageBox*>(QApplication::activeModalWidget());
        ASSERT_TRUE(shown && shown->button(button));
        said = shown->windowTitle() + QLatin1Char('|') + shown->text();
        if (shown->buttons().size() > 1 && shown->defaultButton())
            said += QLatin1Char('|') + shown->defaultButton()->text().remove(QLatin1Char('&'));
        shown->button(button)->click();
    });
}

} // namespace orvela
