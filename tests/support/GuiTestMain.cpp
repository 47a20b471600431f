#include "Settings/SettingsStore.h"

#include <QApplication>
#include <QRegularExpression>
#include <QStringList>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace {

QStringList gWarnings;

void collect(QtMsgType type, const QMessageLogContext&, const QString& text) {
    static const QRegularExpression harmless(QStringLiteral("This plugin does not support|XDG_RUNTIME_DIR"));
    if (type != QtDebugMsg && type != QtInfoMsg && !harmless.match(text).hasMatch())
        gWarnings.append(text);
}

/// Gives every test an empty settings store, and fails one during which Qt warned, such as of a slot that
/// connectSlotsByName finds no signal for.
class FreshStart : public testing::EmptyTestEventListener {
    void OnTestStart(const testing::TestInfo&) override {
        gWarnings.clear();
        orvela::openSettings().clear();
    }
    void OnTestEnd(const testing::TestInfo&) override {
        for (const QString& text : gWarnings)
            ADD_FAILURE() << "Qt warned: " << qPrintable(text);
    }
};

} // namespace

int main(int argc, char** argv) {
    testing::InitGoogleTest(&argc, argv);
    const QTemporaryDir settings; // nobody's own settings are touched
    qputenv("XDG_CONFIG_HOME", settings.path().toLocal8Bit());
    qInstallMessageHandler(collect);
    QApplication application(argc, argv);
    orvela::setSettingsApplication(QStringLiteral("OrvelaGuiTests"));
    testing::UnitTest::GetInstance()->listeners().Append(new FreshStart);
    return RUN_ALL_TESTS();
}
