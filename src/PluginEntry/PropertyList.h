#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

namespace orvela {

/// What a host reads in the module's file before it loads it: what the filter is called, where it stands in
/// the menu, which image modes it takes, and the name of its entry point.
namespace PropertyList {

/// A 16-bit resource version, 32-bit list version and 32-bit count before the properties, each of which has
/// 16 bytes before its data.
inline constexpr std::size_t kSize = 374;

/// The section of the module's file that holds the list where the system has no resources.
#define ORVELA_PROPERTY_LIST_SECTION ".pipl"

/// The entry point's property bears the name of the processor on 64-bit Windows.
#ifdef _WIN64
inline constexpr std::string_view kEntryKey = "8664";
#else
inline constexpr std::string_view kEntryKey = "wx86";
#endif

namespace detail {

/// Puts properties one behind the other, numbers with their low byte first.
class Writer {
public:
    constexpr Writer() {
        number(1, 2); // of the resource
        number(0, 4); // of the list
        number(8, 4); // properties
    }

    /// Codes of four characters are numbers, too.
    constexpr void code(std::string_view text) {
        for (std::size_t i = text.size(); i > 0; --i)
            byte(text[i - 1]);
    }

    constexpr void number(std::uint32_t value, int bytes) {
        for (int i = 0; i < bytes; ++i, value >>= 8)
            mBytes[mSize++] = static_cast<std::uint8_t>(value);
    }

    /// The head of a property whose `length` bytes, a multiple of 4, follow.
    constexpr void head(std::string_view key, std::uint32_t length) {
        code("8BIM");
        code(key);
        number(0, 4);
        number(length, 4);
    }

    /// A text that ends with zeros, at least one.
    constexpr void text(std::string_view key, std::string_view value) {
        head(key, static_cast<std::uint32_t>(value.size() / 4 * 4 + 4));
        characters(value);
    }

    /// A text behind its length, filled up with zeros.
    constexpr void countedText(std::string_view key, std::string_view value) {
        head(key, static_cast<std::uint32_t>((value.size() + 4) / 4 * 4));
        number(static_cast<std::uint32_t>(value.size()), 1);
        characters(value);
    }

    constexpr std::size_t size() const { return mSize; }
    constexpr const std::array<std::uint8_t, kSize>& bytes() const { return mBytes; }

private:
    constexpr void byte(char value) { mBytes[mSize++] = static_cast<std::uint8_t>(value); }

    constexpr void characters(std::string_view value) {
        for (const char each : value)
            byte(each);
        while (mSize % 4 != kHead % 4)
            byte(0);
    }

    static constexpr std::size_t kHead = 10;
    std::array<std::uint8_t, kSize> mBytes{};
    std::size_t mSize = 0;
};

constexpr Writer written() {
    Writer list;
    list.head("kind", 4);
    list.code("8BFM");
    list.countedText("catg", "Kestrand");
    list.countedText("name", "Orvela 2.0");
    list.head("vers", 4);
    list.number(0x00040000, 4);
    list.text(kEntryKey, "PluginMain");
    list.head("mode", 4);
    list.number(0, 4); // no bits: the next one decides
    list.text("enbl",
              "in (PSHOP_ImageMode, GrayScaleMode, RGBMode, CMYKMode, HSLMode, HSBMode, "
              "MultichannelMode, DuotoneMode, LabMode, Gray16Mode, RGB48Mode, CMYK64Mode, Lab48Mode)");
    list.head("fici", 28);
    for (int filterCase = 0; filterCase < 7; ++filterCase)
        list.number(0x00'01'01'01, 4); // straight data in and out, the source not copied to the destination
    return list;
}

} // namespace detail

static_assert(detail::written().size() == kSize);
inline constexpr std::array<std::uint8_t, kSize> kBytes = detail::written().bytes();

} // namespace PropertyList

} // namespace orvela
