#pragma once

#include "Settings/CUserParams.h"

#include <map>
#include <string>

namespace orvela {

/// The statistics and flags of a parameter object by name.
inline std::map<std::string, double> statistics(const CUserParams& params) {
    std::map<std::string, double> fields;
#define ORVELA_STATISTIC_FIELD(type, name, value, listed) fields[#name] = static_cast<double>(params.name);
#define ORVELA_KEPT_FIELD(type, name, listed) fields[#name] = static_cast<double>(params.name);
#include "Settings/StatisticFields.inc"
    return fields;
}

/// Sets every statistic to -7, which no task writes, so that a field left alone shows.
inline void markStatistics(CUserParams& params) {
#define ORVELA_STATISTIC_FIELD(type, name, value, listed) params.name = static_cast<type>(-7);
#define ORVELA_KEPT_FIELD(type, name, listed) params.name = static_cast<type>(-7);
#include "Settings/StatisticFields.inc"
}

} // namespace orvela
