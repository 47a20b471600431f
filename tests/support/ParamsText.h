#pragma once

#include "Settings/CUserParams.h"

#include <QStringList>

#include <stdexcept>

namespace orvela {

/// Sets a slider, a switch, a statistic or a flag by its name; "pHisto_Luma[128]" is a bin. Throws
/// std::invalid_argument for other names.
inline void setField(CUserParams& params, const QString& name, double value) {
    bool known = name.startsWith("pHisto_Luma[");
    if (known)
        params.pHisto_Luma.at(name.section('[', 1).chopped(1).toUInt()) = value;
    const auto take = [&](const char* field, auto& target) {
        if (name != field)
            return;
        target = static_cast<std::remove_reference_t<decltype(target)>>(value);
        known = true;
    };
    take("Final_Touch_Mode_Enabled", params.Final_Touch_Mode_Enabled);
#define ORVELA_SLIDER_FIELD(type, field, listed) take(#field, params.mSliderParams.field);
#include "Settings/SliderFields.inc"
#define ORVELA_STATISTIC_FIELD(type, field, start, listed) take(#field, params.field);
#define ORVELA_KEPT_FIELD(type, field, listed) take(#field, params.field);
#include "Settings/StatisticFields.inc"
    if (!known)
        throw std::invalid_argument(name.toStdString());
}

/// Parameters written as text: "name=value name=value name", where a name alone is a switch that is on.
inline CUserParams paramsFrom(const std::string& text) {
    CUserParams params;
    for (const QString& word : QString::fromStdString(text).split(' ', Qt::SkipEmptyParts))
        setField(params, word.section('=', 0, 0), word.contains('=') ? word.section('=', 1).toDouble() : 1);
    return params;
}

} // namespace orvela
