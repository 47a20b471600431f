#pragma once

namespace orvela {

/// Has the process end with the status that `last` returns, once every other static object is gone.
void endWith(int (*last)());

} // namespace orvela
