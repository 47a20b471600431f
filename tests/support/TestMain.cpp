#include "Settings/SettingsStore.h"
#include "Utility/CGenericEx.h"

#include <QCoreApplication>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace {

/// No test sees the failures that another one recorded.
class FreshRecord : public testing::EmptyTestEventListener {
    void OnTestStart(const testing::TestInfo&) override { orvela::ExceptionStack::clear(); }
};

} // namespace

int main(int argc, char** argv) {
    testing::InitGoogleTest(&argc, argv);
    const QTemporaryDir settings; // nobody's own settings are touched
    qputenv("XDG_CONFIG_HOME", settings.path().toLocal8Bit());
    QCoreApplication application(argc, argv);
    orvela::setSettingsApplication(QStringLiteral("OrvelaTests"));
    testing::UnitTest::GetInstance()->listeners().Append(new FreshRecord);
    return RUN_ALL_TESTS();
}
