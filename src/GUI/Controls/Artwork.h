#pragma once

namespace orvela {

/// Makes the pictures below ":/" available; they live in a static library, which would drop them otherwise.
/// Further calls do nothing.
void initArtwork();

} // namespace orvela
