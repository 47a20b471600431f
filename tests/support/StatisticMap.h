#pragma once

#include "Settings/CUserParams.h"

#include <map>
#include <string>

namespace orvela {

/// The statistics and flags of a parameter object by name.
inline std::map<std::string, double> statistics(const CUserParams& params) {
    std::map<std::string, double> fields;
    for (const StatisticField& field : statisticFields())
        fields[field.name] = field.valueIn(params);
    return fields;
}

/// Sets every statistic to -7, which no task writes, so that a field left alone shows.
inline void markStatistics(CUserParams& params) {
    for (const StatisticField& field : statisticFields())
        field.setIn(params, -7);
}

} // namespace orvela
