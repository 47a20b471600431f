#include "module/ForeignHost.h"

#include <numeric>

using namespace orvela;

namespace {

class PropertyListTest : public ProgramTest {
protected:
    // What a program of the system prints.
    static QByteArray output(const char* program, const QStringList& arguments) {
        QProcess process;
        process.start(QLatin1String(program), arguments);
        EXPECT_TRUE(process.waitForFinished());
        EXPECT_EQ(process.exitCode(), 0) << process.readAllStandardError().toStdString();
        return process.readAllStandardOutput();
    }
};

const QString kModule = QStringLiteral(ORVELA_MODULE);

// Head of a property: vendor, key and id as they are stored, and the length of what follows.
QByteArray property(const char* storedKey, char length, const QByteArray& data) {
    return QByteArray("MIB8") + storedKey + QByteArray(4, '\0') + length + QByteArray(3, '\0') + data;
}

} // namespace

TEST_F(PropertyListTest, StandsInTheModuleByteForByte) {
    output("objcopy", {QStringLiteral("--dump-section"), QStringLiteral(".pipl=") + path("list"), kModule,
                       path("copy")});
    const QByteArray head("\x01\x00\x00\x00\x00\x00\x08\x00\x00\x00", 10);
    const QByteArray expected =
        head + property("dnik", 4, "MFB8") + property("gtac", 12, QByteArray("\x08Kestrand\0\0\0", 12)) +
        property("eman", 12, QByteArray("\x0AOrvela 2.0\0", 12)) +
        property("srev", 4, QByteArray("\0\0\4\0", 4)) +
        property("68xw", 12, QByteArray("PluginMain\0\0", 12)) + property("edom", 4, QByteArray(4, '\0')) +
        property("lbne", char(160),
                 QByteArray("in (PSHOP_ImageMode, GrayScaleMode, RGBMode, CMYKMode, HSLMode, HSBMode, "
                            "MultichannelMode, DuotoneMode, LabMode, Gray16Mode, RGB48Mode, CMYK64Mode, "
                            "Lab48Mode)\0",
                            160)) +
        property("icif", 28, QByteArray("\1\1\1\0", 4).repeated(7));
    EXPECT_EQ(expected.size(), 374);
    EXPECT_EQ(bytes("list").toHex(' '), expected.toHex(' '));
}

TEST_F(PropertyListTest, NothingButTheEntryPointIsSeenOfTheModule) {
    const QByteArray symbols = output("nm", {QStringLiteral("-D"), QStringLiteral("--defined-only"),
                                             QStringLiteral("--format=posix"), kModule});
    EXPECT_EQ(symbols.count('\n'), 1) << symbols.toStdString();
    EXPECT_TRUE(symbols.startsWith("PluginMain T ")) << symbols.toStdString();
}
