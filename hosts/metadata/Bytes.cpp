#include "metadata/Bytes.h"

namespace orvela {

ByteView slice(ByteView bytes, std::size_t at, std::size_t count) {
    if (at > bytes.size() || count > bytes.size() - at)
        throw DamagedBytes("something lies behind the end");
    return bytes.subspan(at, count);
}

std::uint64_t number(ByteView bytes, std::size_t at, std::size_t size, ByteOrder order) {
    const ByteView digits = slice(bytes, at, size);
    std::uint64_t value = 0;
    for (std::size_t i = 0; i < size; ++i)
        value = value << 8 | digits[order == ByteOrder::Big ? i : size - 1 - i];
    return value;
}

ByteView Cursor::take(std::uint64_t count) {
    const ByteView taken = slice(mBytes, 0, count);
    mBytes = mBytes.subspan(taken.size());
    return taken;
}

std::uint64_t Cursor::number(std::uint64_t size) {
    return orvela::number(take(size), 0, size, ByteOrder::Big);
}

void store(Bytes& bytes, std::size_t at, std::uint64_t value, std::size_t size, ByteOrder order) {
    slice(bytes, at, size);
    for (std::size_t i = 0; i < size; ++i)
        bytes[at + (order == ByteOrder::Little ? i : size - 1 - i)] =
            static_cast<std::uint8_t>(value >> 8 * i);
}

void append(Bytes& bytes, std::uint64_t value, std::size_t size, ByteOrder order) {
    bytes.resize(bytes.size() + size);
    store(bytes, bytes.size() - size, value, size, order);
}

void append(Bytes& bytes, ByteView more) {
    bytes.insert(bytes.end(), more.begin(), more.end());
}

void append(Bytes& bytes, std::string_view text) {
    bytes.insert(bytes.end(), text.begin(), text.end());
}

void padToEven(Bytes& bytes) {
    bytes.resize(bytes.size() + bytes.size() % 2);
}

bool startsWith(ByteView bytes, std::string_view text) {
    return asText(bytes).starts_with(text);
}

} // namespace orvela
