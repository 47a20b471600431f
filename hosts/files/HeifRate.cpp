#include "files/HeifRate.h"

#include <algorithm>
#include <cmath>
#include <cstring>

namespace orvela {

Photograph heifSample(const Photograph& photograph) {
    constexpr int across = 12;
    constexpr int edge = 64; // of a coding block
    Photograph sample;
    sample.depth = photograph.depth;
    sample.model = photograph.model;
    sample.width = std::min(photograph.width, across * edge);
    sample.height = std::min(photograph.height, across * edge);
    const auto pixel = static_cast<std::size_t>(samplesPerPixel(photograph.model) * photograph.depth / 8);
    const auto offset = [&](const Photograph& of, int x, int y) {
        return (static_cast<std::size_t>(y) * static_cast<std::size_t>(of.width) +
                static_cast<std::size_t>(x)) *
               pixel;
    };
    sample.samples.resize(offset(sample, 0, sample.height));
    // Where a row or column of the sample comes from: each block is one in the middle of its share of the
    // picture. Blocks of the coding itself, since a picture that was coded before takes more when they are
    // parted elsewhere.
    const auto origin = [&](int at, int size) {
        const int share = size / across;
        const int middle = at / edge * share + (share - edge) / 2;
        return size <= across * edge ? at : middle / edge * edge + at % edge;
    };
    for (int y = 0; y < sample.height; ++y)
        for (int x = 0; x < sample.width; x += edge)
            std::memcpy(sample.samples.data() + offset(sample, x, y),
                        photograph.samples.data() +
                            offset(photograph, origin(x, photograph.width), origin(y, photograph.height)),
                        static_cast<std::size_t>(std::min(edge, sample.width - x)) * pixel);
    return sample;
}

// The logarithm of the bytes rises with the quality, but unevenly: a picture that was coded before takes
// hardly more above the quality of that coding, until even its faults are coded.
int matchingQuality(double bytesPerPixel, const std::function<double(int)>& encode) {
    struct Trial {
        int quality;
        double excess; ///< of the logarithm
    };
    constexpr double step = 0.058; // typically: twelve qualities double the bytes
    constexpr double near = 0.06;
    constexpr int most = 5;
    Trial low{kLowestHeifQuality - 1, 0};
    Trial high{kHighestHeifQuality + 1, 0};
    Trial best{60, 1e9};
    int quality = best.quality;
    for (int count = 0; count < most; ++count) {
        const Trial trial{quality, std::log(encode(quality) / bytesPerPixel)};
        if (std::abs(trial.excess) < std::abs(best.excess))
            best = trial;
        if (std::abs(trial.excess) < near)
            break;
        (trial.excess > 0 ? high : low) = trial;
        if (high.quality - low.quality <= 1)
            break;
        const double next =
            low.excess < 0 && high.excess > 0
                ? low.quality - low.excess * (high.quality - low.quality) / (high.excess - low.excess)
                : quality - trial.excess / step;
        quality = std::clamp(static_cast<int>(std::lround(next)), low.quality + 1, high.quality - 1);
    }
    return best.quality;
}

} // namespace orvela
