// Drafts: runs over a part or a reduced copy of a picture, by what a run over the whole one has measured.

#include "Core/CThreadedCore_FinalTouch.h"
#include "Core/CThreadedCore_Orvela.h"
#include "Core/Snapshot.h"
#include "Filters/MeasurementTape.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Settings/ModeTable.h"
#include "Settings/SettingFields.h"
#include "support/TestPlanes.h"

#include <QRect>

#include <gtest/gtest.h>

#include <cstdlib>
#include <random>

using namespace orvela;

namespace {

// Sky, ground, a dark disc and some grain: each part has statistics of its own.
std::unique_ptr<CARGBPlane> scene(int width, int height) {
    std::mt19937 grain(7);
    return testplanes::make(width, height, [&](int x, int y) {
        const int noise = static_cast<int>(grain() % 9);
        const bool disc =
            (x - width / 3) * (x - width / 3) + (y - height / 2) * (y - height / 2) < width * height / 30;
        if (disc)
            return testplanes::Pixel{std::uint8_t(20 + noise), std::uint8_t(30 + noise), std::uint8_t(25)};
        if (2 * y < height)
            return testplanes::Pixel{std::uint8_t(90 + 60 * x / width + noise), std::uint8_t(140 + noise),
                                     std::uint8_t(200 + 30 * y / height)};
        return testplanes::Pixel{std::uint8_t(110 + noise), std::uint8_t(60 + 80 * x / width + noise),
                                 std::uint8_t(40 + 40 * y / height)};
    });
}

template <typename Core>
std::unique_ptr<CARGBPlane> process(const CARGBPlane& picture, const CUserParamsPhotoshop& params,
                                    MeasurementTape& tape, bool plays) {
    CARGBPlane in(picture, QString());
    auto out = std::make_unique<CARGBPlane>(picture, QString());
    const CARGBPlaneProxyDirect proxy(picture, CARGBPlaneProxyDirect::Private);
    Core core(&in, out.get());
    QObject::connect(&core, &CThreadedCore::stepDone, &core, [&core] { core.stepHandled(); });
    core.setProxy(&proxy);
    core.setParams(params);
    if (plays)
        core.playTape(tape);
    else
        core.recordTape(&tape);
    core.run();
    EXPECT_TRUE(core.lastProcessingDone());
    return out;
}

CUserParamsPhotoshop everythingOn(std::uint32_t seed) {
    std::mt19937 random(seed);
    CUserParamsPhotoshop params(Mode_Advanced);
    for (const SliderField& field : sliderFields()) {
        if (field.flag)
            params.mSliderParams.*field.flag = random() % 3 != 0;
        else
            params.mSliderParams.*field.value =
                static_cast<float>(random() % (static_cast<unsigned>(SettingFields::highest(field)) + 1));
    }
    return params;
}

/// What is tried: every mode, and settings that nobody would think of.
std::vector<std::pair<std::string, CUserParamsPhotoshop>> settings() {
    std::vector<std::pair<std::string, CUserParamsPhotoshop>> all;
    for (const ModeDescription& mode : ModeTable::all())
        all.emplace_back(mode.displayName, CUserParamsPhotoshop(mode.mode));
    for (std::uint32_t seed = 1; seed <= 12; ++seed)
        all.emplace_back("random " + std::to_string(seed), everythingOn(seed));
    return all;
}

// Largest difference of the two, without `margin` pixels at the edges of the area.
int difference(const CARGBPlane& whole, const CARGBPlane& part, const QRect& area, int margin) {
    int largest = 0;
    for (int y = margin; y < area.height() - margin; ++y)
        for (int x = margin; x < area.width() - margin; ++x)
            for (std::size_t c = 0; c < 3; ++c)
                largest = std::max(largest, std::abs(testplanes::at(whole, area.x() + x, area.y() + y)[c] -
                                                     testplanes::at(part, x, y)[c]));
    return largest;
}

TEST(Excerpt, OfTheWholePictureIsTheRunItself) {
    const auto picture = scene(311, 207);
    for (const auto& [name, params] : settings()) {
        SCOPED_TRACE(name);
        MeasurementTape tape;
        const auto whole = process<CThreadedCore_Orvela>(*picture, params, tape, false);
        const auto again = process<CThreadedCore_Orvela>(*picture, params, tape, true);
        EXPECT_EQ(testplanes::bytes(*whole), testplanes::bytes(*again));
        EXPECT_FALSE(tape.hasMissed());
        const auto touched = process<CThreadedCore_FinalTouch>(*picture, params, tape, false);
        const auto replayed = process<CThreadedCore_FinalTouch>(*picture, params, tape, true);
        EXPECT_EQ(testplanes::bytes(*touched), testplanes::bytes(*replayed));
    }
}

TEST(Excerpt, OfAPartIsThatPartOfTheRunButForItsEdges) {
    constexpr int edge = 8; // where filters look at pixels outside the part
    const auto picture = scene(900, 600);
    for (const auto& [name, params] : settings()) {
        SCOPED_TRACE(name);
        MeasurementTape tape;
        const auto whole = process<CThreadedCore_Orvela>(*picture, params, tape, false);
        for (const QRect& area : {QRect(0, 0, 200, 150), {330, 250, 140, 120}, {700, 400, 200, 200}}) {
            MeasurementTape played = tape;
            const auto part =
                process<CThreadedCore_Orvela>(*takeSnapshot(*picture, area, 1), params, played, true);
            EXPECT_EQ(difference(*whole, *part, area, edge), 0) << area.x() << "," << area.y();
        }
    }
}

TEST(Excerpt, TellsThatItsSettingsNeedWhatWasNotMeasured) {
    const auto picture = scene(64, 48);
    MeasurementTape tape;
    CUserParamsPhotoshop params(Mode_Adjustments);
    process<CThreadedCore_Orvela>(*picture, params, tape, false);
    params.mSliderParams.GammaCorrectionValue = 700; // an enabled gamma brings a stretch with it
    process<CThreadedCore_Orvela>(*picture, params, tape, true);
    EXPECT_FALSE(tape.hasMissed());
    params.mSliderParams.GammaCorrectionEnabled = true;
    process<CThreadedCore_Orvela>(*picture, params, tape, true);
    EXPECT_TRUE(tape.hasMissed());
}

} // namespace
