#include "files/MetadataTags.h"

#include "files/HeifMetadata.h"

#include <mutex>

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

// The packet as it stands in the file: asked of a constant image it is not made anew, and of a TIFF it is a
// tag.
std::string packetOf(const Exiv2::Image& image) {
    if (!image.xmpPacket().empty())
        return image.xmpPacket();
    for (const Exiv2::Exifdatum& datum : image.exifData())
        if (datum.key() == "Exif.Image.XMLPacket") {
            std::string packet(static_cast<std::size_t>(datum.size()), 0);
            datum.copy(reinterpret_cast<Exiv2::byte*>(packet.data()), Exiv2::littleEndian);
            return packet;
        }
    return {};
}

Tags tagsOf(const MetadataBlocks& blocks) {
    Tags tags;
    if (!blocks.exif.empty())
        Exiv2::ExifParser::decode(tags.exif, blocks.exif.data(),
                                  static_cast<std::uint32_t>(blocks.exif.size()));
    tags.xmp.assign(blocks.xmp.begin(), blocks.xmp.end());
    return tags;
}

} // namespace

std::unique_ptr<Exiv2::Image> openImage(ByteView file) {
    prepareLibrary();
    const auto size = static_cast<long>(file.size());
    if (Exiv2::ImageFactory::getType(file.data(), size) == Exiv2::ImageType::none)
        throw PhotographError("they cannot be found in this kind of file");
    return std::unique_ptr<Exiv2::Image>(Exiv2::ImageFactory::open(file.data(), size).release());
}

Tags readTags(ByteView file, FileFormat format) {
    prepareLibrary();
    if (format == FileFormat::Heif)
        return tagsOf(heifMetadata(file));
    const auto image = openImage(file);
    image->readMetadata();
    return {image->exifData(), image->iptcData(), packetOf(*image), image->comment()};
}

} // namespace orvela
