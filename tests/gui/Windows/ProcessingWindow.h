#pragma once

#include "Core/CThreadedCore_Orvela.h"
#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Preview/CSignaledGraphicsView.h"
#include "GUI/Windows/CDlgSettingsImpl.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "support/TestPlanes.h"

#include <QAbstractButton>
#include <QApplication>
#include <QComboBox>
#include <QDropEvent>
#include <QMimeData>
#include <QTest>

#include <functional>

namespace orvela {

/// What a core makes by itself of a picture, for filters that look at the host's one in `proxy`.
template <class Core = CThreadedCore_Orvela>
std::vector<std::uint8_t> engineResult(const CUserParamsPhotoshop& params, const CARGBPlane& start,
                                       CARGBPlaneProxy& proxy) {
    CARGBPlane in(start, QStringLiteral("in"));
    CARGBPlane out(start, QStringLiteral("out"));
    Core core(&in, &out);
    QObject::connect(&core, &CThreadedCore::stepDone, [&core] { core.stepHandled(); });
    core.setProxy(&proxy);
    core.setParams(params);
    core.run();
    return testplanes::bytes(out);
}

/// Drags files onto a widget as the system does: the event goes up to one that takes drops.
/// @return whether they could be dropped
inline bool drop(QWidget* at, const QList<QUrl>& urls) {
    QMimeData dragged;
    dragged.setUrls(urls);
    QDragEnterEvent enter(QPoint(2, 2), Qt::CopyAction, &dragged, Qt::LeftButton, {});
    QApplication::sendEvent(at, &enter);
    if (!enter.isAccepted())
        return false;
    QDropEvent drop(QPoint(2, 2), Qt::CopyAction, &dragged, Qt::LeftButton, {});
    QApplication::sendEvent(at, &drop);
    return true;
}

/// Moves the mouse over a widget with the left button held.
inline void moveHeldMouse(QWidget* over, QPointF to) {
    QMouseEvent move(QEvent::MouseMove, to, over->mapToGlobal(to), Qt::NoButton, Qt::LeftButton, {});
    QCoreApplication::sendEvent(over, &move);
}

/// A processing window over a picture, driven while it runs.
class ProcessingWindow {
public:
    ProcessingWindow(EGUIMode mode, std::unique_ptr<CARGBPlane> picture)
        : input(std::move(picture)), output(*input, QStringLiteral("output")), proxy(*input),
          window(mode, input.get(), &output) {}

    /// Runs the mode and does `user` as soon as the window serves events.
    void run(const std::function<void()>& user = [] {}) {
        QTimer opened;
        opened.setSingleShot(true);
        QObject::connect(&opened, &QTimer::timeout, &window, [&user] {
            QTest::qWait(1); // the window restores its state first
            user();
        });
        opened.start();
        window.run();
    }

    template <class Widget = QWidget>
    Widget* find(const char* name) {
        return window.findChild<Widget*>(QLatin1String(name));
    }

    COrvelaSliderBlockImpl* block(const char* name = "sldrSaturation") {
        return find<COrvelaSliderBlockImpl>(name);
    }
    QComboBox* presets() { return find<QComboBox>("lstBxPreset"); }
    /// Of the original and the processed picture.
    QList<CSignaledGraphicsView*> views() { return window.findChildren<CSignaledGraphicsView*>(); }
    CThreadedCore* core() { return window.findChildren<CThreadedCore*>().last(); }

    QTimer* refreshTimer() { return find<QTimer>("refreshTimer"); }
    /// The time until a refresh comes by itself, if one is to come, is over.
    void letTheSecondPass() {
        if (!refreshTimer()->isActive())
            return;
        refreshTimer()->stop();
        QMetaObject::invokeMethod(refreshTimer(), "timeout");
    }

    void click(const char* button) { QTest::mouseClick(find(button), Qt::LeftButton); }

    /// What the engine makes of the picture by itself.
    std::vector<std::uint8_t> engineResult(const CUserParamsPhotoshop& params) {
        return orvela::engineResult(params, proxy.plane(), proxy);
    }

    std::unique_ptr<CARGBPlane> input;
    CARGBPlane output;
    CARGBPlaneProxyDirect proxy;
    CDlgSettingsImpl window;
};

} // namespace orvela
