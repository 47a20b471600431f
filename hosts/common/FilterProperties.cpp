#include "common/FilterProperties.h"

#include "common/ModuleSection.h"

#include <string_view>

namespace orvela {

namespace {

constexpr char kSection[] = ".pipl";
constexpr std::uint32_t kNewestInterface = 4; // with sub-version 0

// Numbers and texts one behind the other; codes of four characters are numbers.
class Reader {
public:
    explicit Reader(std::span<const std::uint8_t> bytes) : mBytes(bytes) {}

    std::span<const std::uint8_t> bytes(std::size_t count) {
        if (count > mBytes.size())
            throw ModuleError("its property list is cut");
        const auto taken = mBytes.first(count);
        mBytes = mBytes.subspan(count);
        return taken;
    }

    std::uint32_t number(std::size_t size) {
        std::uint32_t value = 0;
        const auto taken = bytes(size);
        for (std::size_t i = size; i > 0; --i)
            value = value << 8 | taken[i - 1];
        return value;
    }

private:
    std::span<const std::uint8_t> mBytes;
};

constexpr std::uint32_t code(std::string_view text) {
    std::uint32_t value = 0;
    for (const char each : text)
        value = value << 8 | static_cast<unsigned char>(each);
    return value;
}

std::string textUpToZero(std::span<const std::uint8_t> data) {
    std::string text(data.begin(), data.end());
    return text.substr(0, text.find('\0'));
}

std::string countedText(std::span<const std::uint8_t> data) {
    Reader reader(data);
    const auto text = reader.bytes(reader.number(1));
    return {text.begin(), text.end()};
}

void take(std::uint32_t key, std::span<const std::uint8_t> data, FilterProperties& properties) {
    if (key == code("catg"))
        properties.category = countedText(data);
    else if (key == code("name"))
        properties.name = countedText(data);
    else if (key == code("wx86") || key == code("8664"))
        properties.entryPoint = textUpToZero(data);
    else if (key == code("enbl"))
        properties.enableExpression = textUpToZero(data);
    else if (key == code("kind") && Reader(data).number(4) != code("8BFM"))
        throw ModuleError("it is no filter");
    else if (key == code("vers") && Reader(data).number(4) > kNewestInterface << 16)
        throw ModuleError("it is made for a newer interface");
}

} // namespace

FilterProperties FilterProperties::parse(std::span<const std::uint8_t> list) {
    Reader reader(list);
    if (reader.number(2) != 1 || reader.number(4) != 0)
        throw ModuleError("its property list has an unknown version");
    FilterProperties properties;
    for (std::uint32_t left = reader.number(4); left > 0; --left) {
        const std::uint32_t vendor = reader.number(4);
        const std::uint32_t key = reader.number(4);
        reader.number(4); // id
        const std::uint32_t length = reader.number(4);
        const auto data = reader.bytes((std::size_t{length} + 3) / 4 * 4).first(length);
        if (vendor == code("8BIM"))
            take(key, data, properties);
    }
    if (properties.entryPoint.empty())
        throw ModuleError("its property list names no entry point");
    return properties;
}

FilterProperties FilterProperties::ofModule(const std::filesystem::path& file) {
    try {
        return parse(sectionOf(file, kSection));
    } catch (const ModuleError& error) {
        throw ModuleError(file.string() + ": " + error.what() + "; install Orvela again");
    }
}

} // namespace orvela
