#include "Settings/PresetFile.h"

#include "support/SettingsMap.h"

#include <gtest/gtest.h>

using namespace orvela;

namespace {

PresetFile parsed(const QByteArray& text) {
    return PresetFile::parse(text, QStringLiteral("p.json"));
}

// Why the text is no preset.
std::string refusal(const QByteArray& text) {
    try {
        parsed(text);
    } catch (const PresetError& error) {
        return error.what();
    }
    return {};
}

TEST(PresetFile, EveryFieldComesBackAsItWas) {
    CSliderParams sliders = distinctSettings();
    sliders.Moire_Enabled = false;
    sliders.mMoire_Value = 0.1F;
    PresetFile written;
    written.take(sliders);
    CSliderParams read;
    read.Moire_Enabled = true;
    parsed(written.text()).applyTo(read);
    EXPECT_EQ(settingsOf(read), settingsOf(sliders));
}

TEST(PresetFile, UnknownNamesAreKeptAndReportedAndUnnamedFieldsStay) {
    PresetFile preset =
        parsed(R"({"version": 1, "author": "A", "settings": {"SaturationValue": 640.5, "Sparkle": [1, 2]}})");
    EXPECT_EQ(preset.unknownNames(), QStringList({QStringLiteral("author"), QStringLiteral("Sparkle")}));
    CSliderParams sliders;
    sliders.mFade_Value = 7;
    preset.applyTo(sliders);
    EXPECT_EQ(sliders.SaturationValue, 640.5F);
    EXPECT_EQ(sliders.mFade_Value, 7.0F);
    preset.take(sliders);
    EXPECT_EQ(parsed(preset.text()).unknownNames().size(), 2);
    EXPECT_TRUE(preset.text().contains("\"author\": \"A\""));
}

TEST(PresetFile, WhatIsNoPresetIsRefusedWithTheCause) {
    const std::pair<const char*, const char*> refused[] = {
        {"{", "is not JSON"},
        {"[1]", "is not a preset"},
        {R"({"version": 1, "settings": 3})", "is not a preset"},
        {R"({"version": 2, "settings": {}})", "has version 2"},
        {R"({"version": 1, "settings": {"mFade_Value": 1000.5}})",
         "mFade_Value must be a number from 0 to 1000"},
        {R"({"version": 1, "settings": {"mColor_Value_R": 256}})", "from 0 to 255"},
        {R"({"version": 1, "settings": {"mFade_Enabled": 1}})", "must be true or false"}};
    for (const auto& [text, cause] : refused) {
        EXPECT_EQ(refusal(text).find("p.json: "), 0U) << text;
        EXPECT_NE(refusal(text).find(cause), std::string::npos) << text << '\n' << refusal(text);
    }
}

} // namespace
