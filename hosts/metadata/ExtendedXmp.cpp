#include "metadata/ExtendedXmp.h"

#include "metadata/TagLibrary.h"

#include <QCryptographicHash>

#include <algorithm>
#include <map>

namespace orvela {

namespace {

using namespace std::string_view_literals;

constexpr auto kHead = "http://ns.adobe.com/xmp/extension/\0"sv;
constexpr std::size_t kIdSize = 32;
constexpr std::size_t kMost = 65000; // of a segment
constexpr int kApp1 = 0xE1;
constexpr auto kEndOfTree = "</rdf:RDF>"sv;

// The property of the main packet that names the other one: an attribute or an element.
struct Reference {
    std::string id;
    std::size_t begin;
    std::size_t end;
};

std::optional<Reference> referenceIn(std::string_view packet) {
    constexpr auto property = "xmpNote:HasExtendedXMP"sv;
    const std::size_t name = packet.find(property);
    if (name == std::string_view::npos)
        return std::nullopt;
    const std::size_t id = packet.find_first_not_of(" \t\r\n=>\"'", name + property.size());
    if (id == std::string_view::npos || packet.size() - id <= kIdSize)
        return std::nullopt;
    const bool isElement = name > 0 && packet[name - 1] == '<';
    const std::size_t last = isElement ? packet.find('>', id) : id + kIdSize;
    if (last == std::string_view::npos)
        return std::nullopt;
    return Reference{std::string(packet.substr(id, kIdSize)), isElement ? name - 1 : name, last + 1};
}

// What stands between the beginning of the tree and its end; empty when there is no tree.
std::string_view treeOf(std::string_view packet) {
    const std::size_t tag = packet.find("<rdf:RDF");
    const std::size_t begin = tag == std::string_view::npos ? tag : packet.find('>', tag);
    const std::size_t end = packet.rfind(kEndOfTree);
    if (begin == std::string_view::npos || end == std::string_view::npos || end <= begin)
        return {};
    return packet.substr(begin + 1, end - begin - 1);
}

// The other packet; empty when a part of it is missing.
std::string otherPacket(const std::string& id, const std::vector<Chunk>& segments) {
    std::map<std::uint64_t, std::string_view> parts;
    std::uint64_t size = 0;
    for (const Chunk& segment : segments) {
        const std::string_view data = asText(segment.data);
        constexpr std::size_t head = kHead.size() + kIdSize + 8;
        if (!data.starts_with(kHead) || data.size() <= head || data.substr(kHead.size(), kIdSize) != id)
            continue;
        size = number(segment.data, head - 8, 4, ByteOrder::Big);
        parts.emplace(number(segment.data, head - 4, 4, ByteOrder::Big), data.substr(head));
    }
    std::string packet;
    for (const auto& [at, text] : parts) {
        if (at != packet.size())
            return {};
        packet += text;
    }
    return packet.size() == size ? packet : std::string();
}

} // namespace

std::optional<PartedXmp> partXmp(ByteView packet) {
    const std::string_view text = asText(packet);
    const std::size_t begin = std::min(text.find("<x:xmpmeta"), text.find("<rdf:RDF"));
    const std::size_t end = text.rfind("<?xpacket");
    if (begin == std::string_view::npos)
        return std::nullopt;
    const std::string_view body =
        text.substr(begin, end == std::string_view::npos || end < begin ? end : end - begin);
    const std::string id =
        QCryptographicHash::hash(QByteArrayView(body.data(), static_cast<qsizetype>(body.size())),
                                 QCryptographicHash::Md5)
            .toHex()
            .toUpper()
            .toStdString();
    const std::string note =
        "<x:xmpmeta xmlns:x=\"adobe:ns:meta/\"><rdf:RDF "
        "xmlns:rdf=\"http://www.w3.org/1999/02/22-rdf-syntax-ns#\"><rdf:Description rdf:about=\"\" "
        "xmlns:xmpNote=\"http://ns.adobe.com/xmp/note/\" xmpNote:HasExtendedXMP=\"" +
        id + "\"/></rdf:RDF></x:xmpmeta>";
    PartedXmp parted{copyOf(asBytes(note)), {}};
    for (std::size_t at = 0; at < body.size(); at += kMost) {
        Bytes data = copyOf(asBytes(kHead));
        append(data, id);
        append(data, body.size(), 4, ByteOrder::Big);
        append(data, at, 4, ByteOrder::Big);
        append(data, body.substr(at, kMost));
        parted.segments.push_back({kExtendedXmp, std::move(data), kApp1});
    }
    return parted;
}

std::optional<Bytes> joinXmp(ByteView main, const std::vector<Chunk>& segments) {
    std::string packet(asText(main));
    const std::optional<Reference> reference = referenceIn(packet);
    if (!reference)
        return std::nullopt;
    const std::string other = otherPacket(reference->id, segments);
    packet.erase(reference->begin, reference->end - reference->begin);
    const std::size_t end = packet.rfind(kEndOfTree);
    if (treeOf(other).empty() || end == std::string::npos)
        return std::nullopt;
    packet.insert(end, treeOf(other));
    const ByteView joined = asBytes(packet);
    return isWellFormedXmp(joined) ? std::optional(copyOf(joined)) : std::nullopt;
}

} // namespace orvela
