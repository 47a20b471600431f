#pragma once

#include "Core/CThreadedCore_Orvela.h"
#include "GUI/Windows/CDlgSettingsImpl.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "support/TestPlanes.h"

#include <QAbstractButton>
#include <QApplication>
#include <QTest>

#include <functional>

namespace orvela {

/// A processing window over a picture, driven while it runs.
class ProcessingWindow {
public:
    ProcessingWindow(EGUIMode mode, std::unique_ptr<CARGBPlane> picture)
        : input(std::move(picture)), output(*input, QStringLiteral("output")), proxy(*input),
          window(mode, input.get(), &output) {}

    /// Runs the mode and does `user` as soon as the window serves events.
    void run(const std::function<void()>& user = [] {}) {
        QTimer::singleShot(0, &window, [user] {
            QTest::qWait(1); // the window restores its state first
            user();
        });
        window.run();
    }

    template <class Widget = QWidget>
    Widget* find(const char* name) {
        return window.findChild<Widget*>(QLatin1String(name));
    }

    CThreadedCore* core() { return window.findChildren<CThreadedCore*>().last(); }

    void click(const char* button) { QTest::mouseClick(find(button), Qt::LeftButton); }

    /// What the engine makes of the picture by itself.
    std::vector<std::uint8_t> engineResult(const CUserParamsPhotoshop& params) const {
        return engineResult<CThreadedCore_Orvela>(params, proxy.plane());
    }

    /// What a core makes by itself of a picture that was made of this one.
    template <class Core>
    std::vector<std::uint8_t> engineResult(const CUserParamsPhotoshop& params,
                                           const CARGBPlane& start) const {
        CARGBPlane in(start, QStringLiteral("in"));
        CARGBPlane out(start, QStringLiteral("out"));
        Core core(&in, &out);
        QObject::connect(&core, &CThreadedCore::stepDone, [&core] { core.stepHandled(); });
        core.setProxy(&proxy);
        core.setParams(params);
        core.run();
        return testplanes::bytes(out);
    }

    std::unique_ptr<CARGBPlane> input;
    CARGBPlane output;
    CARGBPlaneProxyDirect proxy;
    CDlgSettingsImpl window;
};

} // namespace orvela
