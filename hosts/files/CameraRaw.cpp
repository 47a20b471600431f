#include "files/CameraRaw.h"

#include <tiff.h>

#include <algorithm>
#include <array>

namespace orvela {

namespace {

using namespace std::string_view_literals;

constexpr std::size_t kPages = 8;      // that are looked at
constexpr std::size_t kSubImages = 16; // of each
constexpr std::uint16_t kLinearRaw = 34892;

struct Mark {
    std::size_t at;
    std::string_view text;
};

// Canon's CR2, CRW and CR3, Fujifilm's RAF, Olympus' ORF, Panasonic's RW2, Minolta's MRW, Sigma's X3F, Phase
// One's IIQ of either byte order.
constexpr std::array kMarks = {
    Mark{8, "CR\2\0"sv},   Mark{6, "HEAPCCDR"sv}, Mark{4, "ftypcrx "sv}, Mark{0, "FUJIFILMCCD-RAW"sv},
    Mark{0, "IIRO"sv},     Mark{0, "IIRS"sv},     Mark{0, "MMOR"sv},     Mark{0, "IIU\0"sv},
    Mark{0, "\0MRM"sv},    Mark{0, "FOVb"sv},     Mark{8, "IIIITwaR"sv}, Mark{8, "IIIICwaR"sv},
    Mark{8, "MMMMRawT"sv}, Mark{8, "MMMMRawC"sv},
};

bool isRaw(const TiffView& tiff, const TagDirectory& directory) {
    if (directory.find(TIFFTAG_DNGVERSION) != nullptr)
        return true;
    const TagEntry* kind = directory.find(TIFFTAG_PHOTOMETRIC);
    if (kind == nullptr || kind->value.empty())
        return false;
    const std::uint64_t value = tiff.value(*kind);
    return value == PHOTOMETRIC_CFA || value == kLinearRaw;
}

// Of its sub-images as far as they can be followed.
bool holdsRaw(const TiffView& tiff, const TagDirectory& directory) {
    if (isRaw(tiff, directory))
        return true;
    const TagEntry* below = directory.find(TIFFTAG_SUBIFD);
    if (below == nullptr)
        return false;
    const std::size_t count = below->value.size() / std::max<std::size_t>(1, tagTypeSize(below->type));
    for (std::size_t i = 0; i < std::min(count, kSubImages); ++i)
        try {
            if (isRaw(tiff, tiff.directory(tiff.value(*below, i))))
                return true;
        } catch (const DamagedBytes&) {
            // what cannot be followed tells nothing
        }
    return false;
}

} // namespace

bool isCameraRaw(ByteView head) {
    return std::any_of(kMarks.begin(), kMarks.end(), [&](const Mark& mark) {
        return head.size() > mark.at && startsWith(behind(head, mark.at), mark.text);
    });
}

bool isCameraRaw(const TiffView& tiff) {
    const TagChain pages = tiff.chain(kPages);
    return std::any_of(pages.list.begin(), pages.list.end(),
                       [&](const TagDirectory& page) { return holdsRaw(tiff, page); });
}

} // namespace orvela
