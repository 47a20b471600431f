#pragma once

#include "GUI/Panes/IWgtPane.h"
#include "GUI/Presets/CPresetStore.h"
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

    COrvelaSliderBlockImpl* block(const char* name = "sldrSaturation") { return opened.block(name); }
    PresetContent controls() { return CPresetStore::contentOf(&opened.window); }
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

    // A file to be dropped.
    QUrl file(const QByteArray& content, const char* name = "dropped.json") {
        QFile file(mFolder.filePath(QLatin1String(name)));
        EXPECT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(content);
        return QUrl::fromLocalFile(file.fileName());
    }

    ProcessingWindow opened;
    int runs = 0;
    QTemporaryDir mFolder;
};

} // namespace orvela
