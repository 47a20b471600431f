#include "files/PixelBounds.h"

#include <webp/decode.h>

namespace orvela::bounds {

double ofWebp(ByteView webp) {
    constexpr int lossy = 1;
    WebPBitstreamFeatures features{};
    const bool known = WebPGetFeatures(webp.data(), webp.size(), &features) == VP8_STATUS_OK;
    return known && features.format == lossy ? kLossyWebp : kNone;
}

} // namespace orvela::bounds
