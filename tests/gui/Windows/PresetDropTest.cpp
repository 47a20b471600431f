// Preset files dropped on the processing window and its previews.

#include "GUI/Controls/COrvelaSliderBlockImpl.h"
#include "GUI/Presets/CPresetStore.h"
#include "GUI/Preview/CSignaledGraphicsView.h"
#include "Settings/PresetFile.h"
#include "gui/Windows/ProcessingWindow.h"
#include "support/ModalDialog.h"

#include <QMessageBox>
#include <QTemporaryDir>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

using namespace orvela;

namespace {

class PresetDrop : public testing::Test {
protected:
    QString file(const char* name, const QByteArray& content) {
        const QString path = mFolder.filePath(QLatin1String(name));
        QFile file(path);
        EXPECT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(content);
        return path;
    }
    QString file(const char* name, const CSliderParams& settings) {
        PresetFile preset;
        preset.take(settings);
        return file(name, preset.text());
    }

    static void drop(QWidget* at, const QList<QUrl>& urls) {
        ASSERT_TRUE(orvela::drop(at, urls));
        QTest::qWait(1);
    }

    // What the boxes say that the drop brings.
    static std::string dropSays(QWidget* at, const QList<QUrl>& urls) {
        QStringList said;
        const ModalDialogs reader([&said](QDialog& dialog) {
            auto* box = qobject_cast<QMessageBox*>(&dialog);
            if (!box)
                return;
            said += box->text();
            box->accept();
        });
        drop(at, urls);
        return said.join(QLatin1Char('|')).toStdString();
    }

    QTemporaryDir mFolder;
};

TEST_F(PresetDrop, GivesWhatTheFileSaysAndCanBeUndone) {
    CUserParamsPhotoshop wanted(Mode_LandscapePro);
    wanted.mSliderParams.SaturationValue = 612.3456F; // no number that the control shows
    const QUrl preset = QUrl::fromLocalFile(file("mine.json", wanted.mSliderParams));
    ProcessingWindow opened(Mode_Advanced, testplanes::noise(64, 48));
    opened.run([&] {
        const PresetContent before = CPresetStore::contentOf(&opened.window);
        EXPECT_EQ(dropSays(opened.find<COrvelaSliderBlockImpl>("sldrSaturation")->txtValue, {preset}), "");
        const PresetContent after = CPresetStore::contentOf(&opened.window);
        EXPECT_NE(after, before);
        QTest::keyClick(&opened.window, Qt::Key_Z, Qt::ControlModifier);
        EXPECT_EQ(CPresetStore::contentOf(&opened.window), before);
        auto* view = opened.window.findChild<CSignaledGraphicsView*>();
        EXPECT_EQ(dropSays(view->viewport(), {preset}), "");
        EXPECT_EQ(CPresetStore::contentOf(&opened.window), after);
        opened.click("btnOK");
    });
    EXPECT_EQ(testplanes::bytes(opened.output), opened.engineResult(wanted));
}

TEST_F(PresetDrop, RefusesAnythingElseWithAReasonAndChangesNothing) {
    const auto url = [](const QString& path) { return QUrl::fromLocalFile(path); };
    const QString good = file("good.json", CUserParamsPhotoshop(Mode_Automatic).mSliderParams);
    ProcessingWindow opened(Mode_Adjustments, testplanes::noise(16, 12));
    opened.run([&] {
        const PresetContent before = CPresetStore::contentOf(&opened.window);
        const std::pair<QList<QUrl>, const char*> cases[] = {
            {{url(file("photo.jpg", "\xff\xd8\xff"))}, "photo.jpg: is not JSON"},
            {{url(file("other.json", "{\"a\": 1}"))}, "other.json: is not a preset"},
            {{url(file("wrong.json", R"({"version": 1, "settings": {"SaturationValue": 2000}})"))},
             "wrong.json: SaturationValue must be a number from 0 to 1000"},
            {{url(file("newer.json", R"({"version": 9, "settings": {}})"))}, "newer.json: has version 9"},
            {{url(file("large.json", QByteArray(4'000'001, ' ')))}, "large.json: is larger than 4 MB"},
            {{url(mFolder.filePath("missing.json"))}, "missing.json: is not a file"},
            {{url(mFolder.path())}, ": is not a file"},
            {{url(good), url(good)}, "Only one preset file"},
            {{QUrl("https://host.example/good.json")}, "Only one preset file"},
            {{url(file("flash.json", R"({"version": 1, "settings": {"DigitalFlashEnabled": true}})"))},
             "flash.json: holds nothing that these sliders can show (Digital Flash)"},
        };
        for (const auto& [urls, reason] : cases) {
            EXPECT_THAT(dropSays(&opened.window, urls), testing::HasSubstr(reason));
            EXPECT_EQ(CPresetStore::contentOf(&opened.window), before) << reason;
        }
        opened.click("btnCancel");
    });
}

TEST_F(PresetDrop, TellsWhatTheWindowHasNoSliderFor) {
    const QString both = file("both.json", R"({"version": 1, "settings":
        {"DigitalFlashEnabled": true, "SaturationEnabled": true, "SaturationValue": 700}})");
    ProcessingWindow opened(Mode_Adjustments, testplanes::noise(16, 12));
    opened.run([&] {
        auto* saturation = opened.find<COrvelaSliderBlockImpl>("sldr1");
        auto* light = opened.find<COrvelaSliderBlockImpl>("sldr2");
        light->setEnabled(true);
        const double position = light->exactValue();
        EXPECT_EQ(dropSays(&opened.window, {QUrl::fromLocalFile(both)}),
                  "both.json was loaded without what this window has no slider for: Digital Flash");
        EXPECT_TRUE(saturation->isEnabled());
        EXPECT_EQ(saturation->exactValue(), 700);
        EXPECT_FALSE(light->isEnabled());
        EXPECT_EQ(light->exactValue(), position);
        opened.click("btnCancel");
    });
}

TEST_F(PresetDrop, StopsARunAndIsLoadedOnceThatHasReturned) {
    const QUrl preset =
        QUrl::fromLocalFile(file("mine.json", CUserParamsPhotoshop(Mode_Macro).mSliderParams));
    ProcessingWindow opened(Mode_Advanced, testplanes::noise(64, 48));
    opened.run([&] {
        const PresetContent before = CPresetStore::contentOf(&opened.window);
        bool dropped = false;
        QObject::connect(opened.core(), &CThreadedCore::stepDone, &opened.window, [&](int step) {
            if (step != 4 || std::exchange(dropped, true))
                return;
            drop(&opened.window, {preset});
            EXPECT_EQ(CPresetStore::contentOf(&opened.window), before);
        });
        opened.click("btnRefresh");
        EXPECT_TRUE(QTest::qWaitFor([&] { return CPresetStore::contentOf(&opened.window) != before; }));
        opened.click("btnOK");
    });
    EXPECT_EQ(testplanes::bytes(opened.output), opened.engineResult(CUserParamsPhotoshop(Mode_Macro)));
}

} // namespace
