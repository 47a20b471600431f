#include "Settings/SettingsEdit.h"

#include "Settings/SettingsStore.h"
#include "Utility/CGenericEx.h"

#include <QCoreApplication>
#include <QDir>
#include <QFileInfo>

#include <gtest/gtest.h>
#include <sys/mount.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <functional>

using namespace orvela;

namespace {

class SettingsEditTest : public testing::Test {
protected:
    SettingsEditTest() {
        EXPECT_TRUE(QDir().mkpath(folder));
        set("2000/a", 1);
        set("2000/b", 2);
    }
    ~SettingsEditTest() override { EXPECT_TRUE(QDir(folder).removeRecursively()); }

    static void set(const char* key, const QVariant& value) {
        SettingsEdit edit;
        edit.set(QString::fromLatin1(key), value);
        edit.commit();
    }
    QByteArray bytes(const QString& name) const {
        QFile file(name);
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
    }
    /// Expects a change to fail, to name the store and to leave the values as they are, here and on the disk.
    void expectFails() {
        const QByteArray before = bytes(path);
        SettingsEdit edit;
        edit.remove(QStringLiteral("2000"));
        edit.set(QStringLiteral("2000/a"), QByteArray(300000, 'x'));
        edit.set(QStringLiteral("2000/c"), 3);
        try {
            edit.commit();
            ADD_FAILURE() << "written";
        } catch (const CGenericEx& error) {
            EXPECT_TRUE(error.message().contains(path)) << qPrintable(error.message());
        }
        EXPECT_EQ(bytes(path), before);
        EXPECT_EQ(openSettings().value("2000/a").toInt(), before.isEmpty() ? 0 : 1);
        EXPECT_FALSE(openSettings().contains("2000/c"));
    }

    const QString path = openSettings().fileName();
    const QString folder = QFileInfo(path).path();
};

TEST_F(SettingsEditTest, ChangesWhatItIsToldInOrder) {
    SettingsEdit edit;
    edit.set(QStringLiteral("2000/group/x"), 0.1);
    edit.set(QStringLiteral("2000/a"), 5);
    edit.remove(QStringLiteral("2000/group"));
    edit.set(QStringLiteral("2000/group/y"), true);
    edit.commit();
    EXPECT_EQ(bytes(path), "[2000]\na=5\nb=2\ngroup\\y=true\n");
}

TEST_F(SettingsEditTest, FileTooLarge) {
    std::signal(SIGXFSZ, SIG_IGN);
    const rlimit small{1000, RLIM_INFINITY};
    rlimit usual{};
    ASSERT_EQ(getrlimit(RLIMIT_FSIZE, &usual), 0);
    ASSERT_EQ(setrlimit(RLIMIT_FSIZE, &small), 0);
    expectFails();
    ASSERT_EQ(setrlimit(RLIMIT_FSIZE, &usual), 0);
    set("2000/b", 4);
    EXPECT_EQ(bytes(path), "[2000]\na=1\nb=4\n") << "nothing of the failed change comes later";
}

TEST_F(SettingsEditTest, FullOrReadOnlyDisk) {
    const QByteArray place = folder.toLocal8Bit();
    if (mount("tmpfs", place.constData(), "tmpfs", 0, "size=64k") != 0)
        GTEST_SKIP() << "only root mounts";
    set("2000/a", 1);
    expectFails();
    ASSERT_EQ(mount("tmpfs", place.constData(), "tmpfs", MS_REMOUNT | MS_RDONLY, "size=64k"), 0);
    expectFails();
    umount2(place.constData(), MNT_DETACH);
}

TEST_F(SettingsEditTest, FolderInTheFilesPlace) {
    ASSERT_TRUE(QFile::remove(path) && QDir().mkpath(path));
    expectFails();
}

TEST_F(SettingsEditTest, KeepsForeignFiles) {
    QByteArrayList foreign = {"\x89PNG\r\n\x1a\nno settings", "{\"a\": 1}", QByteArray("[2000]\nx=\0", 10),
                              "[2000]\n; by hand\nx=1\n", "[2000\nx=1\n"};
    for (const QByteArray& text : foreign) {
        QFile file(path);
        ASSERT_TRUE(file.open(QIODevice::WriteOnly) && file.write(text) == text.size());
        file.close();
        set("2000/a", 7);
        set("2000/b", 8);
        EXPECT_EQ(openSettings().value("2000/a").toInt(), 7);
    }
    for (QByteArray& text : foreign) {
        const auto number = &text - &foreign.front() + 1;
        EXPECT_EQ(bytes(path + ".kept" + (number > 1 ? QString::number(number) : QString())), text);
    }
    EXPECT_EQ(QDir(folder).entryList(QDir::Files).size(), 1 + foreign.size());
}

TEST_F(SettingsEditTest, TwoProcessesWriteAtOnce) {
    pid_t children[2];
    for (int child = 0; child < 2; ++child) {
        children[child] = fork();
        if (children[child] != 0)
            continue;
        for (int i = 0; i < 40; ++i)
            set(qPrintable(QStringLiteral("2000/p%1/k%2").arg(child).arg(i)), i);
        _exit(0);
    }
    for (const pid_t child : children) {
        int status = -1;
        ASSERT_EQ(waitpid(child, &status, 0), child);
        EXPECT_EQ(status, 0);
    }
    EXPECT_EQ(openSettings().allKeys().size(), 82);
}

TEST_F(SettingsEditTest, TheStoreIsNotThatOfTheProgramAround) {
    const QString name = QCoreApplication::applicationName();
    QCoreApplication::setApplicationName(QStringLiteral("Host"));
    QCoreApplication::setOrganizationName(QStringLiteral("Host"));
    EXPECT_EQ(openSettings().fileName(), path);
    EXPECT_TRUE(path.endsWith(QStringLiteral("Kestrand/OrvelaTests.conf"))) << qPrintable(path);
    set("2000/a", 9);
    EXPECT_TRUE(bytes(path).contains("a=9"));
    QCoreApplication::setApplicationName(name);
    QCoreApplication::setOrganizationName(QStringLiteral("Kestrand"));
}

} // namespace
