#include "GUI/Windows/MessageBoxes.h"

#include "Utility/DebugBoxes.h"

#include <QMessageBox>

namespace orvela {

static_assert(DebugBoxes::Ok == int(QMessageBox::Ok));

namespace {

int present(void* parent, const QString& title, const QString& text, int buttons, int defaultButton) {
    return QMessageBox::warning(static_cast<QWidget*>(parent), title, text,
                                QMessageBox::StandardButtons(QFlag(buttons)),
                                QMessageBox::StandardButton(defaultButton));
}

} // namespace

void installMessageBoxes() {
    DebugBoxes::setPresenter(present);
}

} // namespace orvela
