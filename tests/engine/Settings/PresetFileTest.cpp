#include "Settings/PresetFile.h"

#include "support/SettingsMap.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

using namespace orvela;

namespace {

class PresetFileTest : public testing::Test {
protected:
    QString path() const { return mFolder.filePath(QStringLiteral("preset.json")); }

    void store(const QByteArray& text) const {
        QFile file(path());
        ASSERT_TRUE(file.open(QIODevice::WriteOnly) && file.write(text) == text.size());
    }

    /// Why reading the stored file fails.
    std::string refusal() const {
        try {
            PresetFile::read(path());
        } catch (const PresetError& error) {
            return error.what();
        }
        return {};
    }

    QTemporaryDir mFolder;
};

TEST_F(PresetFileTest, EveryFieldComesBackAsItWas) {
    CSliderParams sliders = distinctSettings();
    sliders.Moire_Enabled = false;
    sliders.mMoire_Value = 0.1F;
    PresetFile written;
    written.take(sliders);
    written.write(path());
    CSliderParams read;
    read.Moire_Enabled = true;
    PresetFile::read(path()).applyTo(read);
    EXPECT_EQ(settingsOf(read), settingsOf(sliders));
}

TEST_F(PresetFileTest, UnknownNamesAreKeptAndReportedAndUnnamedFieldsStay) {
    store(R"({"version": 1, "author": "A", "settings": {"SaturationValue": 640.5, "Sparkle": [1, 2]}})");
    PresetFile preset = PresetFile::read(path());
    EXPECT_EQ(preset.unknownNames(), QStringList({QStringLiteral("author"), QStringLiteral("Sparkle")}));
    CSliderParams sliders;
    sliders.mFade_Value = 7;
    preset.applyTo(sliders);
    EXPECT_EQ(sliders.SaturationValue, 640.5F);
    EXPECT_EQ(sliders.mFade_Value, 7.0F);
    preset.take(sliders);
    preset.write(path());
    EXPECT_EQ(PresetFile::read(path()).unknownNames().size(), 2);
    QFile file(path());
    EXPECT_TRUE(file.open(QIODevice::ReadOnly) && file.readAll().contains("\"author\": \"A\""));
}

TEST_F(PresetFileTest, WhatIsNoPresetIsRefusedWithTheCause) {
    const std::pair<const char*, const char*> refused[] = {
        {"{", "is not JSON"},
        {"[1]", "is not a preset"},
        {R"({"version": 1, "settings": 3})", "is not a preset"},
        {R"({"version": 2, "settings": {}})", "has version 2"},
        {R"({"version": 1, "settings": {"mFade_Value": 1000.5}})",
         "mFade_Value must be a number from 0 to 1000"},
        {R"({"version": 1, "settings": {"mColor_Value_R": 256}})", "from 0 to 255"},
        {R"({"version": 1, "settings": {"mFade_Enabled": 1}})", "must be true or false"}};
    EXPECT_NE(refusal().find("cannot be read"), std::string::npos);
    for (const auto& [text, cause] : refused) {
        store(text);
        EXPECT_NE(refusal().find(cause), std::string::npos) << text << '\n' << refusal();
    }
}

TEST_F(PresetFileTest, AFailedWriteLeavesTheOldFile) {
    EXPECT_THROW(PresetFile().write(mFolder.filePath(QStringLiteral("none/preset.json"))), PresetError);
    // A folder in the way makes the last act of writing fail.
    const QString taken = mFolder.filePath(QStringLiteral("taken"));
    ASSERT_TRUE(QDir().mkpath(taken + QStringLiteral("/inner")));
    EXPECT_THROW(PresetFile().write(taken), PresetError);
    EXPECT_TRUE(QFileInfo(taken).isDir());
    EXPECT_EQ(QDir(mFolder.path()).entryList(QDir::Files).size(), 0);
}

} // namespace
