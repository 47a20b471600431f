#include "metadata/TagDensity.h"

namespace orvela {

namespace {

Bytes rational(const Rational& value, ByteOrder order) {
    Bytes bytes;
    append(bytes, value.numerator, 4, order);
    append(bytes, value.denominator, 4, order);
    return bytes;
}

// A metre has no number among Exif's units.
Rational perCentimetre(const Rational& perMetre) {
    if (perMetre.denominator <= UINT32_MAX / 100)
        return {perMetre.numerator, perMetre.denominator * 100};
    return {perMetre.numerator / 100, perMetre.denominator};
}

} // namespace

std::vector<TagField> densityFields(const Density& density, ByteOrder order) {
    const bool metric = density.unit == DensityUnit::Metre || density.unit == DensityUnit::Centimetre;
    const bool metre = density.unit == DensityUnit::Metre;
    const std::uint64_t unit = metric ? 3 : density.unit == DensityUnit::Inch ? 2 : 1;
    Bytes unitBytes;
    append(unitBytes, unit, 2, order);
    return {{tiff::XResolution, tiff::RationalType, 1,
             rational(metre ? perCentimetre(density.x) : density.x, order)},
            {tiff::YResolution, tiff::RationalType, 1,
             rational(metre ? perCentimetre(density.y) : density.y, order)},
            {tiff::ResolutionUnit, tiff::Short, 1, unitBytes}};
}

std::optional<Density> densityOf(const TiffView& view, const TagDirectory& directory) {
    const auto rational = [&](std::uint16_t tag) -> Rational {
        const TagEntry* entry = directory.find(tag);
        if (entry != nullptr && !entry->value.empty() &&
            (entry->type == tiff::Short || entry->type == tiff::Long)) // as few programs write them
            return {static_cast<std::uint32_t>(view.value(*entry)), 1};
        if (entry == nullptr || entry->type != tiff::RationalType || entry->value.size() < 8)
            return {0, 0};
        const auto part = [&](std::size_t at) {
            return static_cast<std::uint32_t>(number(entry->value, at, 4, view.order()));
        };
        return {part(0), part(4)};
    };
    Density density{rational(tiff::XResolution), rational(tiff::YResolution)};
    const TagEntry* entry = directory.find(tiff::ResolutionUnit);
    const std::uint64_t unit = entry == nullptr || entry->value.empty() ? 2 : view.value(*entry);
    density.unit = unit == 2 ? DensityUnit::Inch : unit == 3 ? DensityUnit::Centimetre : DensityUnit::None;
    return density.isMeant() ? std::optional(density) : std::nullopt;
}

} // namespace orvela
