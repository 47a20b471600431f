#include "GUI/Windows/WindowSetup.h"

#include "Settings/SettingsStore.h"
#include "support/LogCapture.h"

#include <QDialog>
#include <QDir>
#include <QGuiApplication>
#include <QScreen>

#include <gtest/gtest.h>

using namespace orvela;

TEST(WindowSetup, KeepsThePositionByClassAndNoneThatCannotBeReached) {
    openSettings().clear();
    QDialog first;
    first.move(137, 91);
    storePosition(first);
    EXPECT_EQ(openSettings().value("2000/GUI/QDialog/pos"), QPoint(137, 91));
    QDialog second;
    restorePosition(second);
    EXPECT_EQ(second.pos(), QPoint(137, 91));
    const QRect screen = QGuiApplication::primaryScreen()->availableGeometry();
    const auto restored = [](const QVariant& stored) {
        openSettings().setValue("2000/GUI/QDialog/pos", stored);
        QDialog window;
        window.resize(200, 100);
        window.move(11, 12);
        restorePosition(window);
        return window.pos();
    };
    const QPoint leftOut(-100, 40);
    EXPECT_EQ(restored(leftOut), leftOut);
    for (const QVariant& lost :
         {QVariant(screen.bottomRight() + QPoint(100, 100)), QVariant(QPoint(-210, 40)),
          QVariant(QPoint(40, -90)), QVariant("anywhere"), QVariant()})
        EXPECT_EQ(restored(lost), QPoint(11, 12)) << qPrintable(lost.toString());
}

TEST(WindowSetup, LogsAStoreThatCannotBeWritten) {
    openSettings().clear();
    const QString path = openSettings().fileName();
    QFile::remove(path);
    ASSERT_TRUE(QDir().mkpath(path));
    LogCapture log;
    storePosition(QDialog());
    ASSERT_TRUE(QDir().rmdir(path));
    EXPECT_TRUE(log.has("The settings could not be written to " + path.toStdString() + "."));
}
