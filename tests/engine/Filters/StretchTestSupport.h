#pragma once

#include "Filters/Kernels/HistogramRecount.h"
#include "Utility/CGenericEx.h"
#include "support/LogCapture.h"
#include "support/TestPlanes.h"

#include <QStringList>

#include <gtest/gtest.h>

namespace orvela {

/// What the tests of the automatic contrast and colour filters share.
namespace stretchtest {

using testplanes::at;
using testplanes::Pixel;
using testplanes::uniform;
using P = CSliderParams;
using U = CUserParams;

/// The switches of the purely automatic situation.
constexpr std::initializer_list<bool P::*> kAutomatic = {&P::BilinearFilteringEnabled, &P::OrvelaLevelEnabled,
                                                         &P::OrvelaLevel2Enabled, &P::mFade_Enabled,
                                                         &P::SaturationEnabled};

inline U with(std::initializer_list<bool P::*> flags) {
    U params;
    for (bool P::*flag : flags)
        params.mSliderParams.*flag = true;
    return params;
}

template <typename Filter>
bool apply(U& params, CARGBPlane& plane) {
    CARGBPlane out(plane, QStringLiteral("out"));
    return Filter({}, &params, &plane, &out).Apply();
}

/// A picture, a setting and the bytes they lead to, worked out by data/automatic_contrast.py.
struct Case {
    std::string filter;
    int width, height;
    float setting;
    const char *before, *after; ///< samples, channel after channel
};

/// Runs the filter on every generated case of its name; the setting is luma or position, as it needs.
template <typename Filter>
void expectGenerated(const std::string& filter, const U& params) {
    static const Case kCases[] = {
#include "engine/data/AutomaticContrast.inc"
    };
    for (const Case& each : kCases) {
        if (filter != each.filter)
            continue;
        CARGBPlane plane(each.width, each.height, QStringLiteral("case"));
        const QByteArray before = QByteArray::fromHex(each.before);
        for (int c = 0; c < 3; ++c)
            std::copy_n(before.data() + c * plane.pixelCount(), plane.pixelCount(),
                        plane.samples(Channel{c}));
        U run = params;
        recountHistograms(plane, run, 1, 1);
        run.m_OriginalLuma = run.mSliderParams.mAuto_Color_Value = each.setting;
        EXPECT_TRUE(apply<Filter>(run, plane));
        const auto bytes = testplanes::bytes(plane);
        EXPECT_EQ(std::string(bytes.begin(), bytes.end()), QByteArray::fromHex(each.after).toStdString());
    }
}

/// Whether the filter applies under `params`; a stop request ends it at `source`.
template <typename Filter>
bool applies(U params, const QString& source) {
    params.mCancelRequested = true;
    ExceptionStack::clear();
    EXPECT_FALSE(apply<Filter>(params, *uniform(4, 4, {50, 90, 120})));
    const QStringList records = ExceptionStack::entries();
    EXPECT_TRUE(records.empty() || records[0].startsWith(source + " CGenericEx User canceled."));
    return !records.empty();
}

/// 720 x 720 pixels, half of `dark` and half of `light`, but for the first `odd` pixels of the first row. A
/// bin counts from 73 samples on, in the second scan of a hazy picture from 721 on. With a side of 700 every
/// bin counts at first.
inline auto halves(Pixel dark, Pixel light, Pixel oddColour, int odd, int side = 720) {
    return testplanes::make(side, side, [=](int x, int y) {
        return y == 0 && x < odd ? oddColour : y < 360 ? dark : light;
    });
}

/// A hazy picture, by luma 60 to 120 at first, 80 to 120 once the thin bins no longer count.
template <typename Filter>
void expectHazyStretch(U params) {
    for (const int side : {720, 700}) {
        const auto plane = halves({80, 90, 70}, {120, 120, 120}, {60, 60, 60}, 100, side);
        const LogCapture log;
        ASSERT_TRUE(apply<Filter>(params, *plane));
        EXPECT_TRUE(params.m_Opaco && log.has("C_Left_limit: 60.000000 ") &&
                    log.has("i= C_Left_limit:80 80.000000"));
        EXPECT_EQ(at(*plane, 0, 1), (Pixel{0, 63, 0})); // 10 + 215 * 10 / 40
    }
}

} // namespace stretchtest

} // namespace orvela
