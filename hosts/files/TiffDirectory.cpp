#include "files/TiffDirectory.h"

#include <algorithm>
#include <map>

namespace orvela {

namespace {

constexpr std::size_t kEntrySize = 12;

std::uint32_t number(const Bytes& file, std::size_t at, std::size_t bytes) {
    std::uint32_t value = 0;
    for (std::size_t i = bytes; i-- > 0;)
        value = value << 8 | file.at(at + i);
    return value;
}

void append(Bytes& to, std::uint32_t value, std::size_t bytes) {
    for (std::size_t i = 0; i < bytes; ++i)
        to.push_back(static_cast<std::uint8_t>(value >> 8 * i));
}

// The twelve bytes of an entry; longer values go to the file's end.
Bytes packed(Bytes& file, const TiffEntry& entry) {
    Bytes bytes;
    append(bytes, entry.tag, 2);
    append(bytes, entry.type, 2);
    append(bytes, entry.count, 4);
    if (entry.value.size() > 4) {
        append(bytes, static_cast<std::uint32_t>(file.size()), 4);
        file.insert(file.end(), entry.value.begin(), entry.value.end());
        file.resize(file.size() + file.size() % 2);
    } else {
        bytes.insert(bytes.end(), entry.value.begin(), entry.value.end());
        bytes.resize(kEntrySize);
    }
    return bytes;
}

} // namespace

void addTiffEntries(Bytes& file, const std::vector<TiffEntry>& entries) {
    if (entries.empty() || file.size() < 8 || number(file, 0, 4) != 0x002A4949)
        return;
    const std::size_t old = number(file, 4, 4);
    const std::size_t count = number(file, old, 2);
    std::map<std::uint32_t, Bytes> directory; // a directory is sorted by tag
    for (std::size_t at = old + 2; at < old + 2 + count * kEntrySize; at += kEntrySize) {
        const auto first = file.begin() + static_cast<std::ptrdiff_t>(at);
        directory.emplace(number(file, at, 2), Bytes(first, first + kEntrySize));
    }
    const std::uint32_t next = number(file, old + 2 + count * kEntrySize, 4);
    file.resize(file.size() + file.size() % 2);
    for (const TiffEntry& entry : entries)
        directory.emplace(entry.tag, packed(file, entry));

    Bytes start;
    append(start, static_cast<std::uint32_t>(file.size()), 4);
    std::copy(start.begin(), start.end(), file.begin() + 4);
    append(file, static_cast<std::uint32_t>(directory.size()), 2);
    for (const auto& [tag, bytes] : directory)
        file.insert(file.end(), bytes.begin(), bytes.end());
    append(file, next, 4);
}

} // namespace orvela
