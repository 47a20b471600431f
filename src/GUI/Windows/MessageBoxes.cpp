#include "GUI/Windows/MessageBoxes.h"

#include "Utility/DebugBoxes.h"

#include <QApplication>
#include <QMessageBox>
#include <QPointer>
#include <QThread>

namespace orvela {

static_assert(DebugBoxes::Ok == int(QMessageBox::Ok));

namespace {

bool canShow() {
    const auto* application = qobject_cast<QApplication*>(QCoreApplication::instance());
    return application && application->thread() == QThread::currentThread();
}

// A window that was closed may still count as the active one, and be about to go.
QWidget* currentWindow() {
    QWidget* modal = QApplication::activeModalWidget();
    QWidget* window = modal ? modal : QApplication::activeWindow();
    return window && window->isVisible() ? window : nullptr;
}

int present(void* parent, const QString& title, const QString& text, int buttons, int defaultButton) {
    if (!canShow())
        return DebugBoxes::Ok;
    // Without a parent it would lie below windows that stay on top.
    auto* above = parent ? static_cast<QWidget*>(parent) : currentWindow();
    const QPointer<QMessageBox> box = new QMessageBox(QMessageBox::Warning, title, text,
                                                      QMessageBox::StandardButtons(QFlag(buttons)), above);
    box->setDefaultButton(QMessageBox::StandardButton(defaultButton));
    box->exec();
    if (!box) // its parent has gone, and it with it
        return DebugBoxes::Ok;
    const int answer = box->standardButton(box->clickedButton());
    delete box;
    return answer;
}

} // namespace

void installMessageBoxes() {
    DebugBoxes::setPresenter(present);
}

void setMainWindow(QWidget& window) {
    DebugBoxes::setMainWindow(&window);
    QObject::connect(&window, &QObject::destroyed, [main = &window] {
        if (DebugBoxes::mainWindow() == main)
            DebugBoxes::setMainWindow(nullptr);
    });
}

} // namespace orvela
