#include "files/TiffPageStream.h"

#include <algorithm>

namespace orvela {

std::size_t TiffPageStream::read(std::uint64_t at, std::span<std::uint8_t> to) {
    const std::uint64_t first = std::min(at, mFile.size());
    const Bytes bytes = mFile.read(first, std::min<std::uint64_t>(to.size(), mFile.size() - first));
    std::copy(bytes.begin(), bytes.end(), to.begin());
    for (const Link& link : mLinks)
        for (std::size_t i = 0; i < link.bytes.size(); ++i)
            if (const std::uint64_t place = link.at + i; place >= first && place - first < bytes.size())
                to[place - first] = link.bytes[i];
    return bytes.size();
}

} // namespace orvela
