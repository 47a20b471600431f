#include "Settings/SettingsStore.h"

#include <QCoreApplication>
#include <QTemporaryDir>

#include <gtest/gtest.h>

int main(int argc, char** argv) {
    testing::InitGoogleTest(&argc, argv);
    const QTemporaryDir settings; // nobody's own settings are touched
    qputenv("XDG_CONFIG_HOME", settings.path().toLocal8Bit());
    QCoreApplication application(argc, argv);
    orvela::setSettingsApplication(QStringLiteral("OrvelaTests"));
    return RUN_ALL_TESTS();
}
