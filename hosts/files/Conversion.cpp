#include "files/Conversion.h"

#include <cstring>

namespace orvela {

namespace {

bool isGrey(ColorModel model) {
    return model == ColorModel::Grey || model == ColorModel::GreyAlpha;
}

bool isForGrey(const Bytes& profile) {
    constexpr std::size_t colorSpace = 16;
    return profile.size() > colorSpace && startsWith(ByteView(profile).subspan(colorSpace), "GRAY");
}

ColorModel modelAfter(ColorModel model, const Conversion& conversion) {
    if (model == ColorModel::Cmyk)
        return model;
    const bool grey = isGrey(model) && !conversion.colours;
    const bool alpha = hasAlpha(model) && !conversion.flattens && !conversion.dropsExtra;
    if (grey)
        return alpha ? ColorModel::GreyAlpha : ColorModel::Grey;
    return alpha ? ColorModel::RgbAlpha : ColorModel::Rgb;
}

/// The samples of a photograph, 0 to 65535 whatever their depth.
class Samples {
public:
    explicit Samples(const Photograph& photograph)
        : mSamples(photograph.samples.data()), mDeep(photograph.depth == 16) {}

    std::uint32_t operator[](std::size_t index) const {
        if (!mDeep)
            return mSamples[index] * 257U;
        std::uint16_t value = 0;
        std::memcpy(&value, mSamples + index * 2, sizeof value);
        return value;
    }

private:
    const std::uint8_t* mSamples;
    bool mDeep;
};

// White where the picture is transparent.
std::uint32_t overWhite(std::uint32_t sample, std::uint32_t alpha) {
    constexpr std::uint64_t full = 65535;
    return static_cast<std::uint32_t>((std::uint64_t{sample} * alpha + full * (full - alpha) + full / 2) /
                                      full);
}

} // namespace

Conversion conversionFor(FileFormat format, const Photograph& photograph) {
    const bool deep = photograph.depth == 16;
    Conversion conversion;
    conversion.dropsExtra = photograph.extraChannel && format != FileFormat::Tiff;
    switch (format) {
    case FileFormat::Jpeg:
        conversion.flattens = hasAlpha(photograph.model) && !photograph.extraChannel;
        conversion.bits = deep ? 8 : 0;
        break;
    case FileFormat::WebP:
        conversion.colours = isGrey(photograph.model);
        conversion.bits = deep ? 8 : 0;
        break;
    case FileFormat::Heif:
        conversion.colours = isGrey(photograph.model);
        conversion.bits = deep && photograph.encoding.bitDepth <= 8 ? heifBitDepth(photograph) : 0;
        break;
    default: // hold what the program reads, or are refused
        break;
    }
    conversion.dropsProfile = conversion.colours && isForGrey(photograph.iccProfile);
    return conversion;
}

std::vector<std::string> losses(const Conversion& conversion) {
    std::vector<std::string> lost;
    if (conversion.bits > 0)
        lost.push_back("16 bits per sample (" + std::to_string(conversion.bits) + " are kept)");
    if (conversion.flattens)
        lost.emplace_back("transparency (laid over white)");
    if (conversion.dropsExtra)
        lost.emplace_back("the extra channel");
    if (conversion.dropsProfile)
        lost.emplace_back("the ICC profile, which is one for grey");
    return lost;
}

bool changesSamples(const Conversion& conversion) {
    return conversion.flattens || conversion.dropsExtra || conversion.colours || conversion.bits == 8;
}

Photograph converted(const Photograph& photograph, const Conversion& conversion) {
    Photograph result = photograph;
    result.depth = conversion.bits == 8 ? 8 : photograph.depth;
    result.model = modelAfter(photograph.model, conversion);
    result.extraChannel = photograph.extraChannel && !conversion.dropsExtra;
    if (conversion.dropsProfile)
        result.iccProfile.clear();

    const Samples from(photograph);
    const auto pixels =
        static_cast<std::size_t>(photograph.width) * static_cast<std::size_t>(photograph.height);
    const auto before = static_cast<std::size_t>(samplesPerPixel(photograph.model));
    const auto after = static_cast<std::size_t>(samplesPerPixel(result.model));
    const std::size_t colors = isGrey(result.model) ? 1 : result.model == ColorModel::Cmyk ? 4 : 3;
    const bool grey = isGrey(photograph.model);
    result.samples.resize(pixels * after * static_cast<std::size_t>(result.depth / 8));
    for (std::size_t i = 0; i < pixels; ++i)
        for (std::size_t k = 0; k < after; ++k) {
            const std::size_t first = i * before;
            std::uint32_t value = from[first + (k >= colors ? before - 1 : grey ? 0 : k)];
            if (conversion.flattens)
                value = overWhite(value, from[first + before - 1]);
            const std::size_t to = i * after + k;
            if (result.depth == 8) {
                result.samples[to] = static_cast<std::uint8_t>((value + 128) / 257);
            } else {
                const auto deep = static_cast<std::uint16_t>(value);
                std::memcpy(result.samples.data() + to * 2, &deep, sizeof deep);
            }
        }
    return result;
}

int heifBitDepth(const Photograph& photograph) {
    constexpr int plain = 10;
    return photograph.encoding.bitDepth > 8 ? photograph.encoding.bitDepth : plain;
}

} // namespace orvela
