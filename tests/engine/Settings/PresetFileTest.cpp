#include "Settings/PresetFile.h"

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
        ASSERT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(text);
    }

    QByteArray stored() const {
        QFile file(path());
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
    }

    std::string refusal(const QByteArray& text) const {
        store(text);
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
    CSliderParams sliders;
    float value = 0.1F;
    bool on = false;
    for (const SliderField& field : sliderFields()) {
        if (field.flag)
            sliders.*field.flag = on = !on;
        else
            sliders.*field.value = value += 1.7F;
    }
    PresetFile written;
    written.take(sliders);
    written.write(path());
    CSliderParams read;
    PresetFile::read(path()).applyTo(read);
    for (const SliderField& field : sliderFields()) {
        if (field.flag)
            EXPECT_EQ(read.*field.flag, sliders.*field.flag) << field.name;
        else
            EXPECT_EQ(read.*field.value, sliders.*field.value) << field.name;
    }
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
    EXPECT_TRUE(stored().contains("\"author\": \"A\""));
}

TEST_F(PresetFileTest, WhatIsNoPresetIsRefusedWithTheCause) {
    const auto says = [this](const char* text, const char* cause) {
        return refusal(text).find(cause) != std::string::npos;
    };
    EXPECT_TRUE(says("{", "is not JSON"));
    EXPECT_TRUE(says("[1]", "is not a preset"));
    EXPECT_TRUE(says(R"({"version": 1, "settings": 3})", "is not a preset"));
    EXPECT_TRUE(says(R"({"version": 2, "settings": {}})", "has version 2"));
    EXPECT_TRUE(says(R"({"version": 1, "settings": {"mFade_Value": 1000.5}})",
                     "mFade_Value must be a number from 0 to 1000"));
    EXPECT_TRUE(says(R"({"version": 1, "settings": {"mColor_Value_R": 256}})", "from 0 to 255"));
    EXPECT_TRUE(says(R"({"version": 1, "settings": {"mFade_Enabled": 1}})", "must be true or false"));
    EXPECT_THROW(PresetFile::read(mFolder.filePath(QStringLiteral("none"))), PresetError);
}

TEST_F(PresetFileTest, AFailedWriteLeavesTheOldFile) {
    EXPECT_THROW(PresetFile().write(mFolder.filePath(QStringLiteral("none/preset.json"))), PresetError);
    // A folder in the way makes the last act of writing fail.
    const QString taken = mFolder.filePath(QStringLiteral("taken"));
    ASSERT_TRUE(QDir(mFolder.path()).mkpath(taken + QStringLiteral("/inner")));
    EXPECT_THROW(PresetFile().write(taken), PresetError);
    EXPECT_TRUE(QFileInfo(taken).isDir());
    EXPECT_EQ(QDir(mFolder.path()).entryList(QDir::Files).size(), 0);
}

} // namespace
