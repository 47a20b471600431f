#pragma once

#include "files/Photograph.h"
#include "files/PixelBounds.h"

#include <cstdint>
#include <filesystem>
#include <limits>

namespace orvela {

/// What reading a photograph may take.
struct ReadLimits {
    double megapixels = std::numeric_limits<double>::infinity(); ///< larger pictures are refused
    std::uint64_t sampleCopies = 1; ///< how often the caller will hold the samples
    std::uint64_t workBytes = 0;    ///< what it will need beside them, for each pixel
    std::uint64_t mappedBytes = 0;  ///< that it will map whatever the size
};

/// What a file says of its picture before any of it is decoded.
struct DeclaredPicture {
    std::int64_t width = 0;
    std::int64_t height = 0;
    std::uint64_t sampleBytes = 3; ///< of each pixel, decoded
    std::uint64_t fileBytes = 0;
    double mostPixelsPerByte = bounds::kNone; ///< that the coding of the file allows
    std::uint64_t decoderBytes = 0;           ///< that decoding takes of each pixel beside the result
    bool fileInView = false;                  ///< otherwise it is in memory, and let go once it is decoded
};

/// Bytes of a pixel of the photograph.
std::uint64_t sampleBytes(const Photograph& photograph);

/// Refuses a file that is to be read into memory as a whole and does not fit. @throws MemoryError
void checkFileSize(std::uint64_t bytes, const std::filesystem::path& path, const ReadLimits& limits);

/// Refuses a picture before its memory is asked for: without pixels, with edges that the filter record cannot
/// express, with more pixels than wanted or than its file can hold, or for which the memory does not suffice.
/// @throws PhotographError, MemoryError
void checkPicture(const DeclaredPicture& picture, const std::filesystem::path& path,
                  const ReadLimits& limits);

/// Refuses a photograph before it is worked on when the memory does not suffice to encode the result, which
/// takes so many bytes beside it. @param kind  of file, for the message @throws MemoryError
void checkEncoding(const Photograph& photograph, const std::string& kind, std::uint64_t bytes);

} // namespace orvela
