#include "metadata/TagLibrary.h"

#include "metadata/TiffStructure.h"

#include <algorithm>
#include <exiv2/exiv2.hpp>
#include <map>
#include <mutex>
#include <set>

namespace orvela {

namespace {

void lockXmp(void* mutex, bool lock) {
    auto* held = static_cast<std::recursive_mutex*>(mutex);
    if (lock)
        held->lock();
    else
        held->unlock();
}

void prepareLibrary() {
    static std::recursive_mutex mutex;
    static const bool ready = [] {
        Exiv2::XmpParser::initialize(lockXmp, &mutex);
        Exiv2::LogMsg::setLevel(Exiv2::LogMsg::mute);
        return true;
    }();
    static_cast<void>(ready);
}

// Offsets and the like, which a new layout changes by itself.
bool isPlacement(const Exiv2::Exifdatum& datum) {
    static const std::set<std::string> keys = {"Exif.Image.ExifTag",
                                               "Exif.Image.GPSTag",
                                               "Exif.Photo.InteroperabilityTag",
                                               "Exif.Photo.MakerNote",
                                               "Exif.MakerNote.Offset",
                                               "Exif.MakerNote.ByteOrder",
                                               "Exif.Thumbnail.JPEGInterchangeFormat"};
    return keys.contains(datum.key());
}

// Further pages and sub-images hold pictures of their own.
bool describesPicture(const Exiv2::Exifdatum& datum) {
    const std::string group = datum.groupName();
    if (group == "Thumbnail" || group.starts_with("SubImage") || group.starts_with("SubThumb") ||
        group == "Image2" || group == "Image3")
        return false;
    return group != "Image" || !isTiffStructure(datum.tag());
}

// Names of the tags that are not in the second with the value that they have in the first.
std::vector<std::string> changed(const Exiv2::ExifData& before, const Exiv2::ExifData& after) {
    std::multimap<std::string, std::string> there;
    for (const Exiv2::Exifdatum& datum : after)
        there.emplace(datum.key(), datum.toString());
    std::vector<std::string> names;
    for (const Exiv2::Exifdatum& datum : before) {
        if (isPlacement(datum) || !describesPicture(datum))
            continue;
        const auto [first, last] = there.equal_range(datum.key());
        const auto same =
            std::find_if(first, last, [&](const auto& entry) { return entry.second == datum.toString(); });
        if (same != last)
            there.erase(same);
        else
            names.push_back(datum.key());
    }
    return names;
}

RewrittenExif encode(const Exiv2::ExifData& tags, ByteOrder order) {
    Exiv2::Blob blob;
    Exiv2::ExifParser::encode(blob, order == ByteOrder::Little ? Exiv2::littleEndian : Exiv2::bigEndian,
                              tags);
    RewrittenExif rewritten{Bytes(blob.begin(), blob.end()), {}};
    Exiv2::ExifData again;
    if (!rewritten.block.empty())
        Exiv2::ExifParser::decode(again, rewritten.block.data(),
                                  static_cast<std::uint32_t>(rewritten.block.size()));
    rewritten.lost = changed(tags, again);
    return rewritten;
}

} // namespace

RewrittenExif rewriteTiffExif(ByteView file) {
    prepareLibrary();
    try {
        Exiv2::ExifData all;
        Exiv2::IptcData iptc;
        Exiv2::XmpData xmp;
        Exiv2::TiffParser::decode(all, iptc, xmp, file.data(), static_cast<std::uint32_t>(file.size()));
        Exiv2::ExifData tags;
        for (const Exiv2::Exifdatum& datum : all)
            if (describesPicture(datum))
                tags.add(datum);
        return encode(tags, TiffView(file).order());
    } catch (const Exiv2::AnyError& error) {
        throw DamagedBytes(error.what());
    }
}

bool isWellFormedXmp(ByteView packet) {
    prepareLibrary();
    try {
        Exiv2::XmpData parsed;
        return Exiv2::XmpParser::decode(parsed, std::string(asText(packet))) == 0;
    } catch (const std::exception&) {
        return false;
    }
}

std::vector<std::string> iptcNames(ByteView iptc) {
    prepareLibrary();
    Exiv2::IptcData data;
    std::vector<std::string> names;
    if (Exiv2::IptcParser::decode(data, iptc.data(), static_cast<std::uint32_t>(iptc.size())) != 0)
        return names;
    for (const Exiv2::Iptcdatum& datum : data)
        if (datum.tagName() != "RecordVersion" && datum.tagName() != "CharacterSet" &&
            std::find(names.begin(), names.end(), datum.tagName()) == names.end())
            names.push_back(datum.tagName());
    return names;
}

} // namespace orvela
