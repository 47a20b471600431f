#pragma once

#include "Settings/CUserParams.h"
#include "Settings/SettingFields.h"

#include <QStringList>

#include <algorithm>
#include <stdexcept>

namespace orvela {

/// The bin of a name like "pHisto_Luma[128]", null for other names.
inline double* namedBin(CUserParams& params, const QString& name) {
    const QString histogram = name.section('[', 0, 0);
    if (!name.endsWith(']'))
        return nullptr;
    for (const auto& [known, bins] : {std::pair{"pHisto_Luma", &params.pHisto_Luma},
                                      {"pHisto_Red", &params.pHisto_Red},
                                      {"pHisto_Green", &params.pHisto_Green},
                                      {"pHisto_Blue", &params.pHisto_Blue}}) {
        if (histogram == QLatin1String(known))
            return &bins->at(name.section('[', 1).chopped(1).toUInt());
    }
    return nullptr;
}

/// Sets a slider, a switch, a statistic or a flag by its name, or a bin. Throws
/// std::invalid_argument for other names.
inline void setField(CUserParams& params, const QString& name, double value) {
    if (name == "Final_Touch_Mode_Enabled")
        params.Final_Touch_Mode_Enabled = value != 0;
    else if (double* const bin = namedBin(params, name))
        *bin = value;
    else if (const SliderField* field = SettingFields::find(name.toStdString()); field && field->value)
        params.mSliderParams.*field->value = static_cast<float>(value);
    else if (field)
        params.mSliderParams.*field->flag = value != 0;
    else {
        const auto fields = statisticFields();
        const auto found = std::find_if(fields.begin(), fields.end(),
                                        [&name](const StatisticField& each) { return name == each.name; });
        if (found == fields.end())
            throw std::invalid_argument(name.toStdString());
        found->setIn(params, value);
    }
}

/// Sets fields from text: "name=value name=value name", where a name alone is a switch that is on.
inline void setFields(CUserParams& params, const std::string& text) {
    for (const QString& word : QString::fromStdString(text).split(' ', Qt::SkipEmptyParts))
        setField(params, word.section('=', 0, 0), word.contains('=') ? word.section('=', 1).toDouble() : 1);
}

/// Parameters written as the same text.
inline CUserParams paramsFrom(const std::string& text) {
    CUserParams params;
    setFields(params, text);
    return params;
}

} // namespace orvela
