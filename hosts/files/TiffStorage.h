#pragma once

#include "files/Photograph.h"
#include "files/TiffPage.h"

#include <array>

namespace orvela {

struct WriteOptions;

/// How the samples of a TIFF page are to be stored. Numbers are those of libtiff's <tiff.h>.
struct TiffStorage {
    std::uint16_t compression = 0;
    std::uint16_t predictor = 0; ///< 0 where the compression has none
    std::uint16_t photometric = 0;
    std::uint16_t extraSample = 0; ///< meaning of the transparency, if there is one
    bool separate = false;         ///< one plane after the other
    std::uint32_t tileWidth = 0;   ///< 0: strips
    std::uint32_t tileHeight = 0;
    int quality = 0;                              ///< of JPEG compression
    std::array<std::uint16_t, 2> chroma = {1, 1}; ///< of JPEG compression: pixels per colour, across and down
};

/// Library name of a compression; of kinds that this program does not write, that of one without loss.
const char* tiffCompressionName(std::uint64_t compression);

/// As the page the photograph comes from, if it comes from a TIFF, where `options` say nothing else.
/// @throws TiffError for a compression that is unknown or does not take such pictures
TiffStorage tiffStorage(const Photograph& photograph, const WriteOptions& options);

} // namespace orvela
