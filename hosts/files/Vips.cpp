#include "files/Vips.h"

#include "files/Photograph.h"

#include <algorithm>

namespace orvela {

namespace {

void ignoreMessage(const gchar*, GLogLevelFlags, const gchar*, gpointer) {}

bool start() {
    if (VIPS_INIT("orvela") != 0)
        throw PhotographError("libvips cannot start: " + takeVipsError() + "; check its installation");
    vips_cache_set_max(0);
    vips_concurrency_set(1);
    g_log_set_handler("VIPS",
                      static_cast<GLogLevelFlags>(G_LOG_LEVEL_WARNING | G_LOG_LEVEL_INFO | G_LOG_LEVEL_DEBUG),
                      ignoreMessage, nullptr);
    return true;
}

} // namespace

void startVips() {
    static const bool started = start();
    static_cast<void>(started);
}

std::string takeVipsError() {
    char* text = vips_error_buffer_copy();
    std::string line(text);
    g_free(text);
    while (!line.empty() && line.back() == '\n')
        line.pop_back();
    std::replace(line.begin(), line.end(), '\n', ',');
    return line.empty() ? "unknown cause" : line;
}

} // namespace orvela
