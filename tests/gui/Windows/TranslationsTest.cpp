#include "GUI/Windows/Translations.h"

#include "Core/PipelineTable.h"
#include "GUI/Controls/COrvelaStatusIndicator.h"
#include "GUI/Panes/CWgtPaneAdvancedImpl.h"
#include "GUI/Presets/StoreWriting.h"
#include "GUI/Windows/CDlgAboutImpl.h"
#include "GUI/Windows/CDlgCustomPresetImpl.h"
#include "GUI/Windows/CDlgMainImpl.h"
#include "GUI/Windows/CDlgProgramInfosImpl.h"
#include "GUI/Windows/HelpWindow.h"
#include "GUI/Windows/WindowSetup.h"
#include "Settings/ModeTable.h"
#include "Settings/PresetFile.h"
#include "Settings/SettingsStore.h"
#include "Settings/SliderTable.h"
#include "Update/UpdateMessage.h"
#include "gui/Windows/ProcessingWindow.h"
#include "support/BoxRecorder.h"
#include "support/LogCapture.h"
#include "support/ModalDialog.h"

#include <QCheckBox>
#include <QComboBox>
#include <QDir>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QMessageBox>
#include <QPushButton>
#include <QRegularExpression>
#include <QScopeGuard>
#include <QTabBar>
#include <QTabWidget>
#include <QToolButton>
#include <QTranslator>

#include <gtest/gtest.h>

using namespace orvela;

namespace {

/// Back to the language of the sources in the end.
struct Language {
    explicit Language(const QString& name) { EXPECT_EQ(Translations::install(QLocale(name)), name); }
    ~Language() { Translations::install(QLocale::English); }
};

struct Room {
    QString text;
    int needed = 0;
    int given = 0;
};

Room roomOf(const QTabBar& bar) {
    int needed = 0;
    for (int tab = 0; tab < bar.count(); ++tab)
        needed += std::max(bar.tabRect(tab).width(), bar.fontMetrics().horizontalAdvance(bar.tabText(tab)));
    return {bar.tabText(0), needed, bar.width()};
}

/// The text that a widget shows and what it needs, in one line its width, in several its height.
Room roomOf(const QWidget& widget) {
    const auto advance = [&widget](const QString& text) {
        return widget.fontMetrics().horizontalAdvance(text);
    };
    if (const auto* label = qobject_cast<const QLabel*>(&widget))
        return label->wordWrap() ? Room{label->text(), label->heightForWidth(label->width()), label->height()}
                                 : Room{label->text(), label->sizeHint().width(), label->width()};
    if (const auto* button = qobject_cast<const QToolButton*>(&widget);
        button && button->toolButtonStyle() != Qt::ToolButtonIconOnly)
        return {button->text(), toolButtonWidth(*button), button->width()};
    if (qobject_cast<const QPushButton*>(&widget) || qobject_cast<const QCheckBox*>(&widget))
        return {static_cast<const QAbstractButton&>(widget).text(), widget.sizeHint().width(),
                widget.width()};
    if (const auto* group = qobject_cast<const QGroupBox*>(&widget))
        return {group->title(), advance(group->title() + "  "), group->width()};
    if (const auto* bar = qobject_cast<const QTabBar*>(&widget))
        return roomOf(*bar);
    if (const auto* list = qobject_cast<const QComboBox*>(&widget))
        return {list->currentText(), list->minimumSizeHint().width(), list->width()};
    if (const auto* field = qobject_cast<const QLineEdit*>(&widget)) {
        const QString text = field->text().isEmpty() ? field->placeholderText() : field->text();
        return {text, advance(text), field->width() - 2};
    }
    return {};
}

/// How many texts the window shows; a test fails on each that lacks room.
int expectRoom(const QWidget& window) {
    int count = 0;
    for (const QWidget* widget : window.findChildren<QWidget*>()) {
        const Room room = widget->isVisible() ? roomOf(*widget) : Room();
        if (room.text.isEmpty())
            continue;
        ++count;
        EXPECT_LE(room.needed, room.given)
            << qPrintable(window.windowTitle()) << ": " << qPrintable(widget->objectName()) << ' '
            << qPrintable(room.text);
    }
    return count;
}

void expectRoomInEveryTab(QWidget& window) {
    EXPECT_GT(expectRoom(window), 3);
    for (QTabWidget* tabs : window.findChildren<QTabWidget*>())
        for (int tab = 0; tab < tabs->count(); ++tab) {
            tabs->setCurrentIndex(tab);
            QCoreApplication::processEvents();
            expectRoom(window);
        }
}

void expectRoomInProcessingWindow(EGUIMode mode) {
    ProcessingWindow driven(mode, testplanes::noise(32, 24));
    driven.run([&] {
        if (auto* advanced = driven.window.findChild<CWgtPaneAdvancedImpl*>())
            advanced->on_btnExtendSettings_clicked();
        expectRoomInEveryTab(driven.window);
        for (const QWidget* preview : driven.window.findChildren<QWidget*>())
            if (preview->isWindow() && preview->isVisible())
                expectRoom(*preview);
        driven.window.reject();
    });
}

void expectRoomInMainWindow() {
    openSettings().clear();
    openSettings().setValue(QStringLiteral("UpdateAvailable"), 2.5);
    const auto picture = testplanes::noise(8, 8);
    const QScopeGuard empty([] { openSettings().clear(); }); // of what the window writes in the end
    CDlgMainImpl window(nullptr, picture.get(), picture.get());
    const ModalDialogs boxes([](QDialog& box) { box.accept(); });
    window.on_btnExpand_clicked();
    window.show();
    QCoreApplication::processEvents();
    EXPECT_EQ(expectRoom(window), 14);
    window.on_btnToggleBatchMode_clicked();
    QCoreApplication::processEvents();
    EXPECT_EQ(expectRoom(window), 14);
    EXPECT_EQ(boxes.count, 1);
    for (const QToolButton* button : window.findChildren<QToolButton*>()) {
        EXPECT_EQ(button->width(), 124);
        EXPECT_GE(button->font().pointSizeF(), window.font().pointSizeF() * 0.8) << "too small to read";
    }
}

class EveryLanguage : public testing::TestWithParam<const char*> {};

} // namespace

TEST_P(EveryLanguage, FitsIntoItsRoom) {
    const Language language(GetParam());
    expectRoomInMainWindow();
    for (const ModeDescription& mode : ModeTable::all())
        if (mode.hasSettings && mode.mode != Mode_Custom && !mode.presetName)
            expectRoomInProcessingWindow(mode.mode);
    const auto show = [](QWidget&& window) {
        window.show();
        QCoreApplication::processEvents();
        EXPECT_GT(expectRoom(window), 0);
    };
    show(CDlgAboutImpl(nullptr));
    show(CDlgProgramInfosImpl(nullptr));
    show(UpdateMessage(QStringLiteral("2.5")));
    QWidget owner;
    show(HelpWindow(&owner));
    CDlgCustomPresetImpl chooser(nullptr, [](const QString&) {});
    chooser.lstBxPreset->addItem(QStringLiteral("AutoSaturation"));
    show(std::move(chooser));
}

INSTANTIATE_TEST_SUITE_P(Texts, EveryLanguage, testing::Values("en", "de", "es"),
                         [](const auto& language) { return std::string(language.param); });

TEST(Translations, TakesTheFirstLanguageOfTheUserThatItSpeaks) {
    EXPECT_EQ(Translations::languages(), QStringList({"de", "es"}));
    const std::pair<const char*, const char*> cases[] = {
        {"de_AT", "de"}, {"es_MX", "es"}, {"en_GB", "en"}, {"fr_FR", "en"}, {"C", "en"}};
    for (const auto& [locale, language] : cases) {
        EXPECT_EQ(Translations::install(QLocale(locale)), language);
        const bool isEnglish = Translations::modeName(Mode_AddIllumination) == "Add Illumination";
        EXPECT_EQ(isEnglish, QByteArray(language) == "en") << locale;
    }
}

TEST(Translations, KnowsEveryTextOfTheTables) {
    for (const QString& language : Translations::languages()) {
        QTranslator catalogue;
        ASSERT_TRUE(catalogue.load(QStringLiteral(":/orvela/translations/orvela_") + language));
        const auto expectKnown = [&](const char* context, const char* text) {
            EXPECT_FALSE(catalogue.translate(context, text).isEmpty())
                << qPrintable(language) << ": " << text;
        };
        for (const ModeDescription& mode : ModeTable::all())
            expectKnown("ModeTable", mode.displayName);
        for (const PipelineStep& step : PipelineTable::mainSteps())
            expectKnown("PipelineTable", step.title);
        for (const SliderDescription& slider : SliderTable::sliders()) {
            expectKnown("SliderTable", slider.label);
            expectKnown("SliderTable", slider.help);
        }
    }
}

// The log and the command line can be searched for the text of the sources.
TEST(Translations, SaysInBoxesOnlyWhyThingsFail) {
    const Language german(QStringLiteral("de"));
    try {
        PresetFile::parse(R"({"version": 1, "settings": {"SaturationValue": 2000}})", "%3.json");
        ADD_FAILURE() << "no error";
    } catch (const PresetError& error) {
        EXPECT_STREQ(error.what(), "%3.json: SaturationValue must be a number from 0 to 1000");
        EXPECT_EQ(error.shown(), "%3.json: SaturationValue muss eine Zahl von 0 bis 1000 sein");
    }
    const QString store = openSettings().fileName();
    QFile::remove(store);
    ASSERT_TRUE(QDir().mkpath(store)); // which keeps it from being written
    SettingsEdit edit;
    edit.set("key", 1);
    LogCapture log;
    const QStringList told = boxes([&] { StoreWriting::commit(edit, StoreWriting::Cause::User); });
    ASSERT_TRUE(QDir().rmdir(store));
    EXPECT_TRUE(log.has("The settings could not be written to " + store.toStdString() + "."));
    EXPECT_TRUE(told.value(0).contains("Die Einstellungen konnten nicht in " + store))
        << qPrintable(told.join('|'));
    EXPECT_TRUE(Translations::causeOf({"Unable to allocate", true}).startsWith("der Arbeitsspeicher"));
    EXPECT_EQ(Translations::causeOf({"unknown error", false}), "unbekannter Fehler");
    EXPECT_EQ(Translations::causeOf({"of a library", false}), "of a library");
}

TEST(Translations, TellsTheStepsOfARunAndLeavesKeysAsTheyAre) {
    const Language german(QStringLiteral("de"));
    QMessageBox box(QMessageBox::Question, {}, {}, QMessageBox::Yes | QMessageBox::No);
    EXPECT_EQ(box.button(QMessageBox::No)->text(), "&Nein");
    ProcessingWindow driven(Mode_Advanced, testplanes::noise(32, 24));
    QStringList steps;
    driven.run([&] {
        EXPECT_EQ(driven.window.windowTitle(), "Erweitert");
        const QStringList keys = openSettings().allKeys();
        EXPECT_FALSE(keys.filter("2000/UserPresets/Advanced/LandscapePro/").isEmpty());
        EXPECT_TRUE(driven.find<QComboBox>("lstBxPreset")->findText("LandscapePro") >= 0);
        const auto* progress = driven.find<COrvelaStatusIndicator>("prgBrCoreStatus");
        QObject::connect(driven.core(), &CThreadedCore::stepDone, progress,
                         [&] { steps.append(progress->stepName()); });
        driven.click("btnRefresh");
        EXPECT_EQ(progress->toolTip(), progress->stepName());
        driven.window.reject();
    });
    EXPECT_TRUE(steps.contains("Automatisches Gamma, erster Durchgang")) << qPrintable(steps.join('|'));
    EXPECT_TRUE(steps.filter(QRegularExpression("Histo|_|Copying|Done|Super")).isEmpty());
}
