#pragma once

namespace orvela {

/// The version of this program; shown with two decimals.
inline constexpr double kRunningVersion = ORVELA_RUNNING_VERSION;

} // namespace orvela
