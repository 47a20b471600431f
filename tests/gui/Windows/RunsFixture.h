#pragma once

#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Panes/IWgtPane.h"
#include "Settings/SettingsStore.h"
#include "gui/Windows/ProcessingWindow.h"

#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace orvela {

constexpr int kLong = 1300; ///< milliseconds: the refresh that comes by itself would have come

/// A processing window whose core runs while the user does something.
class Runs : public testing::Test {
protected:
    explicit Runs(EGUIMode mode = Mode_Advanced) : opened(mode, testplanes::noise(72, 48)) {}

    COrvelaSliderBlockImpl* block(const char* name) { return opened.find<COrvelaSliderBlockImpl>(name); }
    void countRuns() {
        QObject::connect(opened.core(), &CThreadedCore::started, &opened.window, [this] { ++runs; });
    }

    // Once, at a step of the run that comes next.
    void during(const std::function<void()>& user, int at = 3) {
        auto once = std::make_shared<bool>(false);
        QObject::connect(opened.core(), &CThreadedCore::stepDone, &opened.window, [=](int step) {
            if (step == at && !std::exchange(*once, true))
                user();
        });
    }

    CUserParamsPhotoshop settings() {
        CUserParamsPhotoshop params(Mode_Advanced);
        opened.window.findChild<IWgtPane*>()->applyGUIParams(params);
        return params;
    }

    // The picture that OK leaves is what the settings, as they stand in the window, ask for.
    void expectWholeResult() {
        EXPECT_TRUE(opened.window.appliesOnFinish());
        EXPECT_TRUE(testplanes::bytes(opened.output) == opened.engineResult(settings()));
    }

    QString file(const QByteArray& content) {
        const QString path = mFolder.filePath(QStringLiteral("dropped.json"));
        QFile file(path);
        EXPECT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(content);
        return path;
    }
    static void drop(QWidget* at, const QString& path) {
        EXPECT_TRUE(orvela::drop(at, {QUrl::fromLocalFile(path)}));
    }

    ProcessingWindow opened;
    int runs = 0;

private:
    QTemporaryDir mFolder;
};

} // namespace orvela
