#include "Core/CThreadedCore_FinalTouch.h"
#include "Core/CThreadedCore_Orvela.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Settings/ModeTable.h"
#include "support/StatisticMap.h"
#include "support/TaskSettings.h"

#include <QStringList>

#include <gtest/gtest.h>

#include <set>

using namespace orvela;

namespace {

using Written = std::map<std::string, std::set<std::string>>;

// Expects each statistic of a run to stay inside its range and to be changed by no task but its writers; adds
// the tasks that changed it.
template <typename Core>
void expectHolds(const CARGBPlane& picture, CUserParamsPhotoshop params, Written& written) {
    CARGBPlane in(picture, QString());
    CARGBPlane out(picture, QString());
    const CARGBPlaneProxyDirect proxy(picture);
    Core core(&in, &out);
    QObject::connect(&core, &CThreadedCore::stepDone, &core, &CThreadedCore::stepHandled);
    std::map<std::string, double> before = statistics(params);
    core.setParams(params);
    core.setObserver([&](const TaskReport& report) {
        for (const StatisticField& field : statisticFields()) {
            const double value = field.valueIn(core.params());
            EXPECT_TRUE(value >= field.low && value <= field.high)
                << field.name << ' ' << value << " after " << report.name;
            if (value == std::exchange(before[field.name], value))
                continue;
            written[field.name].insert(report.name);
            const QStringList writers = QString::fromLatin1(field.writer).split(QStringLiteral(", "));
            // What the pipeline itself writes between tasks shows after the next one.
            EXPECT_TRUE(writers.contains(report.name) || writers.contains("main pipeline"))
                << field.name << " by " << report.name;
        }
    });
    core.run();
    EXPECT_TRUE(core.lastProcessingDone());
}

// A dusk: dark blue shadows, an orange glow.
std::unique_ptr<CARGBPlane> dusk() {
    return testplanes::make(120, 90, [](int x, int y) {
        const auto glow = static_cast<std::uint8_t>(std::max(0, 250 - x - 2 * y) + (x * y) % 5);
        return testplanes::Pixel{glow, static_cast<std::uint8_t>(glow / 2), 40};
    });
}

// Every slider on, or only those whose switch begins with `name`: the absolute levels keep the others away.
CUserParamsPhotoshop on(float position, const std::string& name = {}) {
    CUserParamsPhotoshop params = tasksettings::paramsFor("", position);
    for (const SliderField& field : sliderFields())
        if (field.flag)
            params.mSliderParams.*field.flag = std::string(field.name).starts_with(name);
    return params;
}

TEST(StatisticFields, StayInsideTheirRangesAndAreWrittenByTheirWritersOnly) {
    const std::unique_ptr<CARGBPlane> pictures[] = {dusk(), testplanes::noise(150, 100),
                                                    testplanes::uniform(60, 40, {240, 240, 60}),
                                                    testplanes::uniform(60, 40, {120, 130, 125})};
    Written written;
    for (const auto& picture : pictures) {
        for (const ModeDescription& mode : ModeTable::all())
            if (mode.hasSettings)
                expectHolds<CThreadedCore_Orvela>(*picture, CUserParamsPhotoshop(mode.mode), written);
        for (const float position : {0.0F, 700.0F, 1000.0F}) {
            expectHolds<CThreadedCore_Orvela>(*picture, on(position), written);
            expectHolds<CThreadedCore_FinalTouch>(*picture, on(position), written);
            expectHolds<CThreadedCore_FinalTouch>(*picture, on(position, "mPerceptual_"), written);
        }
    }
    for (const StatisticField& field : statisticFields()) {
        const bool reached = std::string(field.name) != "Soft_Orvela"; // that no position clears
        EXPECT_EQ(written[field.name].empty(), *field.writer == 0 || !reached) << field.name;
    }
}

} // namespace
