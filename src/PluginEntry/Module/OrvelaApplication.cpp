#include "PluginEntry/Module/OrvelaApplication.h"

#include "Utility/Logger.h"

OrvelaApplication::OrvelaApplication(int threads) : mScheduler(threads) {
    using namespace orvela;
    Log::log(LogLevel::Debug, "OrvelaApplication: default_num_threads: %d noThreads:%d",
             RowScheduler::defaultThreads(), threads);
}
