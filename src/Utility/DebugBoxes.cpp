#include "Utility/DebugBoxes.h"

#include <QtGlobal>

namespace orvela {

namespace DebugBoxes {

namespace {
Presenter gPresenter = nullptr;
void* gMainWindow = nullptr;
} // namespace

void setPresenter(Presenter presenter) {
    gPresenter = presenter;
}

void setMainWindow(void* widget) {
    gMainWindow = widget;
}

void* mainWindow() {
    return gMainWindow;
}

int debugBox(void* parent, const QString& title, const QString& text, int buttons, int defaultButton) {
    if (!qEnvironmentVariableIsSet("ORVELA_DEBUG_MBOX"))
        return Ok;
    return warningBox(parent, title, text, buttons, defaultButton);
}

int warningBox(void* parent, const QString& title, const QString& text, int buttons, int defaultButton) {
    return gPresenter ? gPresenter(parent, title, text, buttons, defaultButton) : Ok;
}

void debugWarning(const QString& text, const QString& title) {
    debugBox(gMainWindow, title, text);
}

} // namespace DebugBoxes

} // namespace orvela
