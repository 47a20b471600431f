#include "metadata/ExtendedXmp.h"

#include "metadata/TagLibrary.h"

#include <QCryptographicHash>

#include <algorithm>
#include <map>
#include <regex>

namespace orvela {

namespace {

using namespace std::string_view_literals;

constexpr auto kHead = "http://ns.adobe.com/xmp/extension/\0"sv;
constexpr std::size_t kIdSize = 32;
constexpr std::size_t kMost = 65000; // of a segment
constexpr int kApp1 = 0xE1;
constexpr auto kEndOfTree = "</rdf:RDF>"sv;

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

std::optional<PartedXmp> partXmp(ByteView bytes) {
    const std::string_view packet = asText(bytes);
    const std::size_t begin = std::min(packet.find("<x:xmpmeta"), packet.find("<rdf:RDF"));
    const std::size_t end = packet.rfind("<?xpacket");
    if (begin == std::string_view::npos)
        return std::nullopt;
    const std::string_view body =
        packet.substr(begin, end == std::string_view::npos || end < begin ? end : end - begin);
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
    static const std::regex reference("xmpNote:HasExtendedXMP(?:\\s*=\\s*[\"']|>)([0-9A-Fa-f]{32})");
    static const std::regex note("\\s+xmpNote:HasExtendedXMP\\s*=\\s*(\"[^\"]*\"|'[^']*')|"
                                 "<xmpNote:HasExtendedXMP>[^<]*</xmpNote:HasExtendedXMP>");
    const std::string packet(asText(main));
    std::smatch found;
    if (!std::regex_search(packet, found, reference))
        return std::nullopt;
    const std::string other = otherPacket(found[1], segments);
    std::string joined = std::regex_replace(packet, note, "");
    const std::size_t end = joined.rfind(kEndOfTree);
    if (treeOf(other).empty() || end == std::string::npos)
        return std::nullopt;
    joined.insert(end, treeOf(other));
    const ByteView result = asBytes(joined);
    return isWellFormedXmp(result) ? std::optional(copyOf(result)) : std::nullopt;
}

} // namespace orvela
