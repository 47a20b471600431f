#include "Settings/CUserParams.h"

#include "Settings/ModeTable.h"
#include "Settings/PaneTable.h"
#include "Utility/DebugBoxes.h"
#include "Utility/Logger.h"

#include <QFile>
#include <QTextStream>

#include <algorithm>
#include <limits>
#include <type_traits>
#include <vector>

using namespace orvela;

namespace {

constexpr double kNoLimit = std::numeric_limits<double>::infinity();

constexpr StatisticField kStatisticFields[] = {
#define ORVELA_STATISTIC_FIELD(type, name, start, listed, meaning, low, high, writer)                        \
    {#name, &CUserParams::name, listed, meaning, low, high, writer},
#define ORVELA_KEPT_FIELD(type, name, meaning, low, high, writer)                                            \
    {#name, &CUserParams::name, 0, meaning, low, high, writer},
#include "Settings/StatisticFields.inc"
};

// One line of the listing.
struct ListedLine {
    int position;
    QByteArray text;
};

template <typename T>
void addLine(std::vector<ListedLine>& lines, int position, const char* label, T value) {
    if (position == 0)
        return;
    char text[128];
    if constexpr (std::is_floating_point_v<T>)
        std::snprintf(text, sizeof text, "%s: %f", label, static_cast<double>(value));
    else
        std::snprintf(text, sizeof text, "%s: %d", label, static_cast<int>(value));
    lines.push_back({position, text});
}

void logInOrder(std::vector<ListedLine>& lines) {
    std::sort(lines.begin(), lines.end(),
              [](const ListedLine& a, const ListedLine& b) { return a.position < b.position; });
    for (const ListedLine& line : lines)
        Log::log(LogLevel::Debug, "%s", line.text.constData());
}

void listSliders(const CSliderParams& sliders, const char* name) {
    Log::scopeEntry(LogLevel::Debug, "Begin Slider Param Listing: %s", name);
    std::vector<ListedLine> lines;
    for (const SliderField& field : sliderFields()) {
        // This one label has always carried a semicolon.
        const bool odd = field.flag == &CSliderParams::mColor_Effect_Intensity_Enabled;
        const char* label = odd ? "mColor_Effect_Intensity_Enabled;" : field.name;
        if (field.flag)
            addLine(lines, field.listed, label, sliders.*field.flag);
        else
            addLine(lines, field.listed, label, sliders.*field.value);
    }
    logInOrder(lines);
    Log::scopeExit(LogLevel::Debug, "End Slider Param Listing");
}

} // namespace

namespace orvela {

double StatisticField::valueIn(const CUserParams& params) const {
    return std::visit([&params](auto member) { return static_cast<double>(params.*member); }, member);
}

void StatisticField::setIn(CUserParams& params, double value) const {
    std::visit(
        [&params, value](auto member) {
            params.*member = static_cast<std::remove_reference_t<decltype(params.*member)>>(value);
        },
        member);
}

std::span<const StatisticField> statisticFields() {
    return kStatisticFields;
}

} // namespace orvela

CUserParams::CUserParams() = default;

void CUserParams::reset() {
    mSliderParams = {};
    mProgressCallback = nullptr;
    mCancelRequested = false;
    Final_Touch_Mode_Enabled = false;
#define ORVELA_STATISTIC_FIELD(type, name, start, listed, meaning, low, high, writer) name = start;
#define ORVELA_KEPT_FIELD(type, name, meaning, low, high, writer)
#include "Settings/StatisticFields.inc"
    for (Histogram* histogram : {&pHisto_Luma, &pHisto_Red, &pHisto_Green, &pHisto_Blue})
        histogram->fill(0.0);
}

void CUserParams::writeHistograms(const QByteArray& path) const {
    QFile file(QString::fromLocal8Bit(path));
    if (!file.open(QIODevice::WriteOnly | QIODevice::Text))
        return;
    QTextStream out(&file);
    out << "Red\tGreen\tBlue\tLuma\n";
    for (std::size_t i = 0; i < pHisto_Luma.size(); ++i)
        out << pHisto_Red[i] << '\t' << pHisto_Green[i] << '\t' << pHisto_Blue[i] << '\t' << pHisto_Luma[i]
            << '\n';
}

void CUserParams::list(const QString& name) const {
    const QByteArray shown = name.toLocal8Bit();
    Log::scopeEntry(LogLevel::Debug, "Begin Globals Listing: %s", shown.constData());
    listSliders(mSliderParams, shown.constData());
    std::vector<ListedLine> lines;
    for (const StatisticField& field : kStatisticFields)
        std::visit([&](auto member) { addLine(lines, field.listed, field.name, this->*member); },
                   field.member);
    logInOrder(lines);
    Log::scopeExit(LogLevel::Debug, "End Globals Listing.");
}

CUserParamsPhotoshop::CUserParamsPhotoshop(EGUIMode mode) {
    const ModeDescription* description = ModeTable::find(mode);
    if (!description || !description->hasSettings) {
        DebugBoxes::debugBox(nullptr, QStringLiteral("Error"), QStringLiteral("unknown mode in CUserParams"));
        return;
    }
    for (const FactorySetting& setting : description->factory) {
        if (setting.value)
            mSliderParams.*setting.value = setting.position;
        if (setting.enabled)
            mSliderParams.*setting.enabled = true;
    }
    if (const PaneSlider* single = PaneTable::single(mode)) {
        const SliderDescription& slider = single->slider;
        mSliderParams.*slider.value = static_cast<float>(single->initial);
        mSliderParams.*slider.enabled = true;
        mGenericSlider = {slider.value,
                          QString::fromLatin1(slider.label),
                          static_cast<std::int32_t>(single->zones()),
                          static_cast<float>(slider.scale->low()),
                          static_cast<float>(slider.scale->high()),
                          slider.scale};
    }
}
