#include "files/Metadata.h"

#include "files/MetadataTags.h"
#include "files/TiffDirectory.h"

#include <algorithm>
#include <array>
#include <map>
#include <regex>
#include <set>

namespace orvela {

namespace {

using Warnings = std::vector<std::string>;

// How a TIFF stores its samples, and the blocks that have places of their own.
constexpr std::array<std::uint16_t, 38> kStructure = {
    0x00FE, 0x00FF, 0x0100, 0x0101, 0x0102, 0x0103, 0x0106, 0x010A, 0x0111, 0x0115, 0x0116, 0x0117, 0x011C,
    0x0122, 0x0123, 0x0124, 0x0125, 0x0129, 0x013D, 0x0140, 0x0142, 0x0143, 0x0144, 0x0145, 0x014A, 0x014C,
    0x0152, 0x0153, 0x015B, 0x0201, 0x0202, 0x0211, 0x0212, 0x0213, 0x0214, 0x02BC, 0x83BB, 0x8773};

// Resolution: a TIFF target has it from the picture already.
constexpr std::array<std::uint16_t, 3> kResolution = {0x011A, 0x011B, 0x0128};

// Transfer function, white point and primaries, which the metadata library leaves out of a TIFF.
constexpr std::array<std::uint16_t, 3> kColorimetry = {0x012D, 0x013E, 0x013F};

constexpr std::uint16_t kXmp = 0x02BC;

template <std::size_t count>
bool isImageTag(const Exiv2::Exifdatum& datum, const std::array<std::uint16_t, count>& tags) {
    return datum.groupName() == "Image" && std::find(tags.begin(), tags.end(), datum.tag()) != tags.end();
}

// Second directories and sub-images hold pixels of their own in a TIFF; elsewhere the second is the
// thumbnail.
bool isOtherPicture(const Exiv2::Exifdatum& datum) {
    const std::string group = datum.groupName();
    return group == "Thumbnail" || group.rfind("SubImage", 0) == 0 || group.rfind("SubThumb", 0) == 0 ||
           group == "Image2" || group == "Image3";
}

// Offsets and blocks that are laid out anew when they are written.
bool isPlacement(const Exiv2::Exifdatum& datum) {
    static const std::set<std::string> keys = {"Exif.Image.ExifTag",
                                               "Exif.Image.GPSTag",
                                               "Exif.Photo.InteroperabilityTag",
                                               "Exif.Photo.MakerNote",
                                               "Exif.MakerNote.Offset",
                                               "Exif.MakerNote.ByteOrder",
                                               "Exif.Image.ImageResources",
                                               "Exif.Thumbnail.JPEGInterchangeFormat"};
    return keys.contains(datum.key());
}

bool isTiff(FileFormat format) {
    return format == FileFormat::Tiff || format == FileFormat::Psd;
}

// The library's XMP reader drops what it cannot parse; the packet itself is kept all the same.
bool isWellFormed(const std::string& packet) {
    Exiv2::XmpData parsed;
    try {
        return Exiv2::XmpParser::decode(parsed, packet) == 0;
    } catch (const std::exception&) {
        return false;
    }
}

void makeUpright(Tags& tags) {
    setIfPresent(tags.exif, "Exif.Image.Orientation", std::uint16_t{1});
    static const std::regex property("(tiff:Orientation(?:=[\"']|>))[2-8]");
    tags.xmp = std::regex_replace(tags.xmp, property, "$011");
}

// The tags that belong into a target of that format.
Exiv2::ExifData exifFor(const Metadata& metadata, FileFormat target) {
    Exiv2::ExifData exif;
    const bool stored = isTiff(metadata.format) || isTiff(target);
    for (const Exiv2::Exifdatum& datum : metadata.tags.exif)
        if (!(stored && (isImageTag(datum, kStructure) || isOtherPicture(datum))) &&
            !(target == FileFormat::Tiff && isImageTag(datum, kResolution)))
            exif.add(datum);
    return exif;
}

// The photograph's metadata as a target of that format is to have it.
Tags tagsFor(const Photograph& photograph, FileFormat target) {
    const Metadata& metadata = *photograph.metadata;
    if (metadata.failure)
        std::rethrow_exception(metadata.failure);
    Tags tags{exifFor(metadata, target), metadata.tags.iptc, metadata.tags.xmp, metadata.tags.comment};
    setIfPresent(tags.exif, "Exif.Photo.PixelXDimension", static_cast<std::uint32_t>(photograph.width));
    setIfPresent(tags.exif, "Exif.Photo.PixelYDimension", static_cast<std::uint32_t>(photograph.height));
    return tags;
}

// The colorimetry among the tags, in the byte order of the encoder's files.
std::vector<TiffEntry> colorimetryOf(const Exiv2::ExifData& exif) {
    std::vector<TiffEntry> entries;
    for (const Exiv2::Exifdatum& datum : exif) {
        if (!isImageTag(datum, kColorimetry))
            continue;
        TiffEntry entry{datum.tag(), static_cast<std::uint16_t>(datum.typeId()),
                        static_cast<std::uint32_t>(datum.count()),
                        Bytes(static_cast<std::size_t>(datum.size()))};
        datum.copy(entry.value.data(), Exiv2::littleEndian);
        entries.push_back(std::move(entry));
    }
    return entries;
}

// The encoded picture with the tags, except the kinds that the format has no place for.
Bytes withTags(const Bytes& encoded, FileFormat target, const Tags& tags) {
    const auto image = openImage(encoded);
    image->readMetadata();
    Exiv2::ExifData exif;
    if (target == FileFormat::Tiff)
        for (const Exiv2::Exifdatum& datum : image->exifData())
            if (isImageTag(datum, kStructure) || isImageTag(datum, kResolution))
                exif.add(datum);
    for (const Exiv2::Exifdatum& datum : tags.exif)
        exif.add(datum);
    const auto takes = [&](Exiv2::MetadataId kind) { return (image->checkMode(kind) & Exiv2::amWrite) != 0; };
    image->setExifData(exif);
    if (takes(Exiv2::mdIptc))
        image->setIptcData(tags.iptc);
    if (takes(Exiv2::mdComment))
        image->setComment(tags.comment);
    image->clearXmpData();
    if (target != FileFormat::Tiff) {
        image->xmpPacket() = tags.xmp; // the setter refuses a malformed packet
        image->writeXmpFromPacket(!tags.xmp.empty());
    }
    image->writeMetadata();
    Exiv2::BasicIo& io = image->io();
    io.open();
    const Exiv2::byte* data = io.mmap();
    Bytes result(data, data + io.size());
    io.munmap();
    if (target == FileFormat::Tiff && !tags.xmp.empty())
        addTiffEntries(result, {{kXmp, Exiv2::unsignedByte, static_cast<std::uint32_t>(tags.xmp.size()),
                                 Bytes(tags.xmp.begin(), tags.xmp.end())}});
    return result;
}

template <typename Data>
std::multimap<std::string, std::string> valuesOf(const Data& data) {
    std::multimap<std::string, std::string> values;
    for (const auto& datum : data)
        values.emplace(datum.key(), datum.toString());
    return values;
}

// Names of the tags that are not in the result with the value that they have in the source.
template <typename Data>
std::string missing(const Data& wanted, const Data& found,
                    bool (*skip)(const typename Data::const_iterator::value_type&)) {
    auto there = valuesOf(found);
    std::string names;
    for (const auto& datum : wanted) {
        if (skip(datum))
            continue;
        const auto [first, last] = there.equal_range(datum.key());
        const auto same =
            std::find_if(first, last, [&](const auto& entry) { return entry.second == datum.toString(); });
        if (same != last)
            there.erase(same);
        else
            names += (names.empty() ? "" : ", ") + datum.key();
    }
    return names;
}

Warnings compare(const Tags& wanted, const Bytes& encoded, FileFormat target) {
    const Tags found = readTags(encoded, target);
    const std::string into = std::string(" did not go into the ") + formatName(target) + " file";
    Warnings warnings;
    const std::string exif = missing<Exiv2::ExifData>(wanted.exif, found.exif, isPlacement);
    const std::string iptc =
        missing<Exiv2::IptcData>(wanted.iptc, found.iptc, [](const Exiv2::Iptcdatum&) { return false; });
    if (!exif.empty())
        warnings.push_back("these Exif tags" + into + ": " + exif);
    if (!iptc.empty())
        warnings.push_back("these IPTC tags" + into + ": " + iptc);
    if (wanted.xmp != found.xmp)
        warnings.push_back("the XMP data" + into);
    if (wanted.comment != found.comment)
        warnings.push_back("the comment" + into);
    return warnings;
}

} // namespace

std::shared_ptr<const Metadata> readMetadata(ByteView file, FileFormat format) {
    const auto metadata = std::make_shared<Metadata>();
    metadata->format = format;
    try {
        metadata->tags = readTags(file, format);
        if (format == FileFormat::Heif)
            makeUpright(metadata->tags);
    } catch (const std::exception&) {
        metadata->failure = std::current_exception();
    }
    return metadata;
}

MetadataBlocks metadataBlocks(const Photograph& photograph) {
    MetadataBlocks blocks;
    if (!photograph.metadata)
        return blocks;
    try {
        const Tags tags = tagsFor(photograph, FileFormat::Heif);
        Exiv2::Blob encoded;
        Exiv2::ExifParser::encode(encoded, Exiv2::littleEndian, tags.exif);
        blocks.exif.assign(encoded.begin(), encoded.end());
        blocks.xmp.assign(tags.xmp.begin(), tags.xmp.end());
    } catch (const std::exception&) {
        // copyMetadata meets the same failure and reports it.
        return {};
    }
    return blocks;
}

std::vector<std::string> copyMetadata(const Photograph& photograph, FileFormat target, Bytes& encoded) {
    if (!photograph.metadata)
        return {};
    Warnings warnings;
    try {
        const Tags tags = tagsFor(photograph, target);
        if (!tags.xmp.empty() && !isWellFormed(tags.xmp))
            warnings.push_back("the XMP data is malformed and was carried over as it stands");
        if (target == FileFormat::Tiff)
            addTiffEntries(encoded, colorimetryOf(tags.exif));
        if (target != FileFormat::Heif)
            encoded = withTags(encoded, target, tags);
        const Warnings lost = compare(tags, encoded, target);
        warnings.insert(warnings.end(), lost.begin(), lost.end());
    } catch (const std::exception& error) {
        warnings.push_back(std::string("the metadata could not be carried over (") + error.what() + ")");
    }
    for (std::string& warning : warnings)
        warning.insert(0, photograph.source.string() + ": ");
    return warnings;
}

} // namespace orvela
