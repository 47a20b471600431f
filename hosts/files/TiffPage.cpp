#include "files/TiffPage.h"

#include <tiff.h>

#include <algorithm>
#include <array>

namespace orvela {

namespace {

bool isWhole(std::uint16_t type) {
    constexpr std::array<int, 6> whole = {TIFF_BYTE, TIFF_SHORT, TIFF_LONG, TIFF_IFD, TIFF_LONG8, TIFF_IFD8};
    return std::find(whole.begin(), whole.end(), type) != whole.end();
}

} // namespace

TiffField tiffField(const TagEntry& entry) {
    return {entry.tag, entry.type, copyOf(entry.value), entry.valueAt};
}

TiffField tiffField(std::uint16_t tag, std::uint16_t type, const std::vector<std::uint64_t>& values,
                    ByteOrder order) {
    TiffField field{tag, type, {}};
    for (const std::uint64_t value : values)
        append(field.value, value, tagTypeSize(type), order);
    return field;
}

std::vector<std::uint64_t> tiffNumbers(const TiffField& field, ByteOrder order) {
    std::vector<std::uint64_t> numbers;
    const std::size_t size = tagTypeSize(field.type);
    for (std::size_t at = 0; isWhole(field.type) && at < field.value.size(); at += size)
        numbers.push_back(number(field.value, at, size, order));
    return numbers;
}

const TiffField* TiffPage::find(std::uint16_t tag) const {
    const auto found = std::find_if(fields.begin(), fields.end(),
                                    [tag](const TiffField& field) { return field.tag == tag; });
    return found == fields.end() ? nullptr : &*found;
}

std::vector<std::uint64_t> TiffPage::numbers(std::uint16_t tag) const {
    const TiffField* field = find(tag);
    return field == nullptr ? std::vector<std::uint64_t>() : tiffNumbers(*field, order);
}

std::uint64_t TiffPage::number(std::uint16_t tag, std::uint64_t otherwise) const {
    const std::vector<std::uint64_t> all = numbers(tag);
    return all.empty() ? otherwise : all.front();
}

} // namespace orvela
