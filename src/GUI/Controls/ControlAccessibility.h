#pragma once

namespace orvela {

/// Makes role, value and range of the controls known to assistive tools. Further calls do nothing.
void installControlAccessibility();

} // namespace orvela
