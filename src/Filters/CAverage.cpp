#include "Filters/CAverage.h"

#include "Utility/Logger.h"

using namespace orvela;

const TaskDescription& CAverage::description() const {
    static constexpr TaskDescription kDescription = {.writes = Writes::Nothing, .testsStop = false};
    return kDescription;
}

bool CAverage::ApplyEmpty() {
    Log::log(LogLevel::Debug, "Applying empty CAverage filter from plane at 0x%x to plane at 0x%x...",
             logAddress(mInPlane.get()), logAddress(mOutPlane.get()));
    Log::log(LogLevel::Debug, "CAverage Filter complete.");
    return false;
}
