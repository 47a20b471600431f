#include "GUI/Windows/WindowSetup.h"

#include "Settings/PresetTree.h"
#include "Settings/SettingsStore.h"
#include "Utility/CGenericEx.h"
#include "Utility/Logger.h"

#include <QCoreApplication>
#include <QGuiApplication>
#include <QPoint>
#include <QScreen>
#include <QWidget>

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

QString withKeys(const QString& toolTip, const QList<QKeySequence>& keys) {
    if (keys.isEmpty())
        return toolTip;
    return QCoreApplication::translate("CDlgSettingsImpl", "%1 (%2)", "tool tip and keys")
        .arg(toolTip, keys.first().toString(QKeySequence::NativeText));
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

void storePosition(const QWidget& window) {
    SettingsEdit edit;
    addPosition(edit, window);
    storeLayout(edit);
}

void addPosition(SettingsEdit& edit, const QWidget& window) {
    edit.set(positionKey(window), window.pos());
}

void storeLayout(const SettingsEdit& edit) {
    try {
        edit.commit();
    } catch (const CGenericEx& failure) {
        Log::log(LogLevel::Warning, "%s", failure.what());
    }
}

} // namespace orvela
