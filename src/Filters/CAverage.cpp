#include "Filters/CAverage.h"

#include "Utility/Logger.h"

using namespace orvela;

bool CAverage::ApplyEmpty() {
    Log::log(LogLevel::Debug, "Applying empty CAverage filter from plane at 0x%x to plane at 0x%x...",
             logAddress(mInPlane), logAddress(mOutPlane));
    Log::log(LogLevel::Debug, "CAverage Filter complete.");
    return false;
}
