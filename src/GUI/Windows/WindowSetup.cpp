#include "GUI/Windows/WindowSetup.h"

#include "GUI/Presets/StoreWriting.h"
#include "Settings/PresetTree.h"
#include "Settings/SettingsStore.h"

#include <QComboBox>
#include <QGuiApplication>
#include <QPoint>
#include <QScreen>
#include <QToolButton>

#include <algorithm>

namespace orvela {

namespace {

QString positionKey(const QWidget& window) {
    return PresetTree::guiKey(QString::fromLatin1(window.metaObject()->className()) + QStringLiteral("/pos"));
}

} // namespace

bool isReachable(const QPoint& position, int width) {
    constexpr int kHold = 24; // pixels
    const QRect title(position, QSize(width, kHold));
    const QList<QScreen*> screens = QGuiApplication::screens();
    return std::any_of(screens.begin(), screens.end(), [&title](const QScreen* screen) {
        const QRect shown = title & screen->availableGeometry();
        return shown.width() >= kHold && shown.height() >= kHold / 2;
    });
}

void flatten(std::initializer_list<QWidget*> buttons) {
    for (QWidget* button : buttons) {
        QPalette palette = button->palette();
        const QBrush window = palette.brush(QPalette::Window);
        for (auto role :
             {QPalette::Light, QPalette::Midlight, QPalette::Dark, QPalette::Mid, QPalette::Shadow})
            palette.setBrush(QPalette::All, role, window);
        button->setPalette(palette);
    }
}

void nameByToolTips(const QWidget& window) {
    for (QWidget* control : window.findChildren<QWidget*>()) {
        const auto* button = qobject_cast<QAbstractButton*>(control);
        if (((button && button->text().isEmpty()) || qobject_cast<QComboBox*>(control)) &&
            control->accessibleName().isEmpty())
            control->setAccessibleName(control->toolTip());
    }
}

void restorePosition(QWidget& window) {
    const QVariant stored = openSettings().value(positionKey(window));
    const QPoint position = stored.toPoint();
    // One that takes its size only when it is shown would end up beside its place, by its frame.
    if (!window.testAttribute(Qt::WA_Resized))
        window.adjustSize();
    if (stored.canConvert<QPoint>() && isReachable(position, window.width()))
        window.move(position);
}

void keepOnScreen(QWidget& window) {
    const QRect screen = window.screen()->availableGeometry();
    const QRect frame = window.frameGeometry();
    const int left = std::max(screen.left(), std::min(frame.left(), screen.right() + 1 - frame.width()));
    const int top = std::max(screen.top(), std::min(frame.top(), screen.bottom() + 1 - frame.height()));
    if (frame.topLeft() != QPoint(left, top))
        window.move(left, top);
}

void storePosition(const QWidget& window) {
    SettingsEdit edit;
    addPosition(edit, window);
    StoreWriting::commit(edit, StoreWriting::Cause::Program);
}

void addPosition(SettingsEdit& edit, const QWidget& window) {
    edit.set(positionKey(window), window.pos());
}

void fitTexts(const QList<QToolButton*>& buttons, QFont font, int width) {
    constexpr double kStep = 0.25;    // points
    constexpr double kSmallest = 0.7; // of the font
    const auto fits = [width](const QToolButton* button) {
        return button->text().isEmpty() || toolButtonWidth(*button) <= width;
    };
    const double smallest = font.pointSizeF() * kSmallest;
    for (;; font.setPointSizeF(font.pointSizeF() - kStep)) {
        for (QToolButton* button : buttons)
            button->setFont(font);
        if (font.pointSizeF() - kStep < smallest || std::all_of(buttons.begin(), buttons.end(), fits))
            return;
    }
}

int toolButtonWidth(const QToolButton& button) {
    // The toolkit asks for a blank at either side of the text, which has its own margins.
    return button.sizeHint().width() - 2 * button.fontMetrics().horizontalAdvance(QLatin1Char(' '));
}

} // namespace orvela
