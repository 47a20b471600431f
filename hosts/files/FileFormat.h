#pragma once

#include "files/Photograph.h"

#include <optional>
#include <string>

namespace orvela {

/// The format that the first bytes of a file show, whatever its name says; none for other kinds of files.
std::optional<FileFormat> formatOfContent(ByteView file);

/// The format that a file name asks for by its extension, in any case; none for other extensions.
std::optional<FileFormat> formatOfExtension(const std::filesystem::path& path);

/// The codec that the extension of a HEIF asks for, "hevc" or "av1"; none for one that is any codec's.
std::optional<std::string> heifCodec(const std::filesystem::path& path);

/// "8-bit CMYK" and the like, for messages.
std::string pixelName(ColorModel model, int depth);

/// Why a file of this format cannot hold the picture, not even after a Conversion, with what to do instead;
/// empty when it can.
std::string formatObstacle(FileFormat format, const Photograph& photograph);

/// Where the result of `source` goes when nothing else is said: NAME-enhanced.EXT beside it, with the
/// source's extension if that fits its format, and .tif for a PSD, which is read but not written.
std::filesystem::path defaultTarget(const std::filesystem::path& source, FileFormat format);

} // namespace orvela
