#pragma once

#include <cstdint>

namespace orvela {

/// Shows the exception that is being handled in a message box, in a CGenericEx the oldest failure on the
/// exception stack as its cause, writes the stack to the log and clears it. Any other exception sets the
/// result cell to the code of a cancelled run.
void showFailure(std::int16_t* result) noexcept;

} // namespace orvela
