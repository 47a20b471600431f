#pragma once

#include "metadata/Metadata.h"
#include "metadata/PngChunks.h"

namespace orvela {

/// The keyword of XMP, and what those of other blocks, whose bytes stand there as digits, begin with.
inline constexpr std::string_view kXmpKeyword = "XML:com.adobe.xmp";
inline constexpr std::string_view kProfileKeyword = "Raw profile type ";
/// That of a text like the comment of a JPEG.
inline constexpr std::string_view kCommentKeyword = "Comment";

/// What a text that cannot be read is called.
inline constexpr char kDamagedText[] = "a PNG text";

/// Bytes that the texts of one file may unpack to, all together.
inline constexpr std::size_t kMostText = std::size_t{32} << 20;

/// How much packed texts may still unpack to.
struct TextRoom {
    std::size_t kept = kMostText;
    std::size_t tried = kMostText * 8; ///< with those that did not fit, which take time all the same
};

/// A text that there is no room for.
class LongText : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

bool isPngText(std::string_view chunk);

/// The keyword of a text; empty where it has no end.
std::string_view pngKeyword(const PngChunk& chunk);

/// A keyword as a message tells of it.
std::string shownKeyword(const std::string& keyword);

/// Reads a text; of one whose keyword means nothing here only that.
/// @param room  becomes less by what it unpacks to
/// @throws DamagedBytes when it cannot be read
/// @throws LongText when it does not fit into the room
Text pngText(const PngChunk& chunk, TextRoom& room);

/// The bytes that a text holds as hexadecimal digits, behind a name and their number.
Bytes rawProfile(const std::string& text);

/// The Exif tag of the first directory that means the same as a keyword; 0 when there is none.
std::uint16_t tagOfKeyword(const std::string& keyword);

/// The chunks that hold the texts.
std::vector<Chunk> pngTexts(const std::vector<Text>& texts);

/// The chunk for Photoshop's resources, among them IPTC.
Chunk pngResources(ByteView resources);

} // namespace orvela
