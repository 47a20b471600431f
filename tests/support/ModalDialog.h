#pragma once

#include <QAbstractButton>
#include <QApplication>
#include <QDialog>
#include <QMessageBox>
#include <QPointer>
#include <QTimer>

#include <functional>

namespace orvela {

/// Lets a user's hand at every modal dialog that opens while this lives: it is called once for each, when the
/// dialog is shown and its event loop runs.
class ModalDialogs {
public:
    explicit ModalDialogs(std::function<void(QDialog&)> hand) : mHand(std::move(hand)) {
        QObject::connect(&mTimer, &QTimer::timeout, [this] {
            auto* dialog = qobject_cast<QDialog*>(QApplication::activeModalWidget());
            if (!dialog || dialog == mSeen || !dialog->isVisible())
                return;
            mSeen = dialog;
            ++count;
            mHand(*dialog);
        });
        mTimer.start(1);
    }

    int count = 0;

private:
    std::function<void(QDialog&)> mHand;
    QPointer<QDialog> mSeen; // another one may come to stand at the same address
    QTimer mTimer;
};

/// "title|text" of every message box that opens while `action` runs; Ok is pressed in each.
inline QStringList messageBoxes(const std::function<void()>& action) {
    QStringList shown;
    const ModalDialogs hand([&shown](QDialog& dialog) {
        auto* box = qobject_cast<QMessageBox*>(&dialog);
        if (!box || !box->button(QMessageBox::Ok))
            return;
        shown += box->windowTitle() + QLatin1Char('|') + box->text();
        box->button(QMessageBox::Ok)->click();
    });
    action();
    return shown;
}

} // namespace orvela
