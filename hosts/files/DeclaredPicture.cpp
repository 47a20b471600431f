#include "files/DeclaredPicture.h"

#include "files/Memory.h"
#include "files/Refusal.h"

#include <algorithm>
#include <cstdio>

namespace orvela {

namespace {

namespace fs = std::filesystem;

std::string sizeText(std::int64_t width, std::int64_t height) {
    return std::to_string(width) + " x " + std::to_string(height) + " pixels";
}

std::string megapixels(double count) {
    char text[40];
    std::snprintf(text, sizeof text, "%.6g megapixels", count);
    return text;
}

void checkEdges(const DeclaredPicture& picture, const fs::path& path) {
    if (picture.width < 1 || picture.height < 1)
        refuse(path, "has no pixels", kCopyAgain);
    if (std::max(picture.width, picture.height) > std::numeric_limits<std::int16_t>::max())
        refuse(path, "is over 32767 pixels wide or high", "scale it down or cut it into parts");
}

// More than there is of anything stays that.
std::uint64_t sum(std::uint64_t a, std::uint64_t b) {
    return a > kUnlimited - std::min(b, kUnlimited) ? kUnlimited : a + b;
}

std::uint64_t product(std::uint64_t a, std::uint64_t b) {
    return b != 0 && a > kUnlimited / b ? kUnlimited : a * b;
}

void checkMemory(const DeclaredPicture& picture, const fs::path& path, const ReadLimits& limits) {
    const auto pixels = static_cast<std::uint64_t>(picture.width * picture.height);
    const std::uint64_t letGo = picture.fileInView ? 0 : picture.fileBytes;
    const std::uint64_t decoding = product(pixels, sum(picture.sampleBytes, picture.decoderBytes));
    const std::uint64_t work =
        product(pixels, sum(product(limits.sampleCopies, picture.sampleBytes), limits.workBytes));
    const std::uint64_t needed = sum(kBesideBytes, std::max(sum(decoding, letGo), work));
    const std::uint64_t addresses = grantedAddresses();
    const std::uint64_t granted =
        sum(std::min(grantedMemory(), addresses - std::min(addresses, limits.mappedBytes)), letGo);
    if (needed > granted)
        throw MemoryError(path.string() + ": its " + sizeText(picture.width, picture.height) +
                          " need about " + amountOf(needed) + " of memory, " + amountOf(granted) +
                          " can be had; " + kMemoryAdvice);
}

} // namespace

std::uint64_t sampleBytes(const Photograph& photograph) {
    return static_cast<std::uint64_t>(samplesPerPixel(photograph.model) * photograph.depth / 8);
}

void checkFileSize(std::uint64_t bytes, const fs::path& path, const ReadLimits& limits) {
    const std::uint64_t granted = obtainableMemory();
    if (bytes + limits.mappedBytes > granted)
        throw MemoryError(path.string() + ": its file of " + amountOf(bytes) +
                          " needs more memory than the " + amountOf(granted) + " that can be had; " +
                          kMemoryAdvice);
}

void checkPicture(const DeclaredPicture& picture, const fs::path& path, const ReadLimits& limits) {
    checkEdges(picture, path);
    const auto pixels = static_cast<double>(picture.width * picture.height);
    if (pixels / picture.mostPixelsPerByte > static_cast<double>(picture.fileBytes))
        refuse(path,
               "is damaged or cut short: it claims " + sizeText(picture.width, picture.height) +
                   ", more than its " + std::to_string(picture.fileBytes) + " bytes can hold",
               kCopyAgain);
    if (pixels > limits.megapixels * 1e6)
        refuse(path,
               "has " + megapixels(pixels / 1e6) + " (" + sizeText(picture.width, picture.height) +
                   "), more than the " + megapixels(limits.megapixels) + " of --max-megapixels",
               "raise it or scale the photograph down");
    checkMemory(picture, path, limits);
}

void checkEncoding(const Photograph& photograph, const std::string& kind, std::uint64_t bytes) {
    const std::uint64_t granted = obtainableMemory();
    if (bytes > granted)
        throw MemoryError(photograph.source.string() + ": to become a " + kind + " its " +
                          sizeText(photograph.width, photograph.height) + " need about " + amountOf(bytes) +
                          " of memory more, " + amountOf(granted) + " can be had; " + kMemoryAdvice);
}

} // namespace orvela
