#pragma once

#include "metadata/Metadata.h"
#include "metadata/PngChunks.h"

namespace orvela {

/// The keyword of XMP, and what those of other blocks, whose bytes stand there as digits, begin with.
inline constexpr std::string_view kXmpKeyword = "XML:com.adobe.xmp";
inline constexpr std::string_view kProfileKeyword = "Raw profile type ";
/// That of a text like the comment of a JPEG.
inline constexpr std::string_view kCommentKeyword = "Comment";

/// Bytes that the texts of one file may unpack to, all together.
inline constexpr std::size_t kMostText = std::size_t{32} << 20;

bool isPngText(std::string_view chunk);

/// The keyword of a text; empty where it has no end.
std::string_view pngKeyword(const PngChunk& chunk);

/// Reads a text; of one whose keyword means nothing here only that.
/// @param room  how much it may unpack to; becomes less by that
/// @throws DamagedBytes when it cannot be read
Text pngText(const PngChunk& chunk, std::size_t& room);

/// The bytes that a text holds as hexadecimal digits, behind a name and their number.
Bytes rawProfile(const std::string& text);

/// The Exif tag of the first directory that means the same as a keyword; 0 when there is none.
std::uint16_t tagOfKeyword(const std::string& keyword);

/// The chunks that hold the texts.
std::vector<Chunk> pngTexts(const std::vector<Text>& texts);

/// The chunk for Photoshop's resources, among them IPTC.
Chunk pngResources(ByteView resources);

} // namespace orvela
