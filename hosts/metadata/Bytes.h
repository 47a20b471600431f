#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <stdexcept>
#include <string_view>
#include <vector>

namespace orvela {

/// Bytes of a file in memory.
using Bytes = std::vector<std::uint8_t>;
using ByteView = std::span<const std::uint8_t>;

enum class ByteOrder { Little, Big };

/// Bytes that do not hold what they claim to.
class DamagedBytes : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

/// `count` bytes from `at` on. @throws DamagedBytes when there are fewer
ByteView slice(ByteView bytes, std::size_t at, std::size_t count);

/// The number in the `size` bytes, 1 to 8, from `at` on. @throws DamagedBytes when there are fewer
std::uint64_t number(ByteView bytes, std::size_t at, std::size_t size, ByteOrder order);

/// Takes bytes and numbers, most significant byte first, off the front of bytes.
class Cursor {
public:
    explicit Cursor(ByteView bytes) : mBytes(bytes) {}

    bool isAtEnd() const { return mBytes.empty(); }
    ByteView rest() const { return mBytes; }

    /// @throws DamagedBytes when there are fewer
    ByteView take(std::uint64_t count);
    /// Of up to 8 bytes. @throws DamagedBytes when there are fewer
    std::uint64_t number(std::uint64_t size);
    /// As many bytes as the four before them tell. @throws DamagedBytes when there are fewer
    ByteView block() { return take(number(4)); }

private:
    ByteView mBytes;
};

/// Overwrites the `size` bytes from `at` on. @throws DamagedBytes when there are fewer
void store(Bytes& bytes, std::size_t at, std::uint64_t value, std::size_t size, ByteOrder order);

void append(Bytes& bytes, std::uint64_t value, std::size_t size, ByteOrder order);
void append(Bytes& bytes, ByteView more);
void append(Bytes& bytes, std::string_view text);

/// A zero where the number of bytes is odd.
void padToEven(Bytes& bytes);

bool startsWith(ByteView bytes, std::string_view text);

/// The bytes without the first `count`, which it has.
inline ByteView behind(ByteView bytes, std::size_t count) {
    return bytes.subspan(count);
}

inline std::string_view asText(ByteView bytes) {
    return {reinterpret_cast<const char*>(bytes.data()), bytes.size()};
}

inline ByteView asBytes(std::string_view text) {
    return {reinterpret_cast<const std::uint8_t*>(text.data()), text.size()};
}

inline Bytes copyOf(ByteView bytes) {
    return {bytes.begin(), bytes.end()};
}

inline bool sameBytes(ByteView a, ByteView b) {
    return asText(a) == asText(b);
}

} // namespace orvela
