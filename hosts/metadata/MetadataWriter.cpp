#include "metadata/MetadataWriter.h"

#include "metadata/ExtendedXmp.h"
#include "metadata/ImageResources.h"
#include "metadata/JpegMetadata.h"
#include "metadata/MetadataReader.h"
#include "metadata/NotePreviews.h"
#include "metadata/PngMetadata.h"
#include "metadata/PngTexts.h"
#include "metadata/TagLibrary.h"
#include "metadata/Utf8.h"
#include "metadata/WebPMetadata.h"

#include <algorithm>
#include <iterator>
#include <regex>

namespace orvela {

namespace {

using Names = std::vector<std::string>;

constexpr std::size_t kLongestComment = 65533; // of a JPEG

// A list that a line has room for.
std::string joined(const Names& names, const char* between) {
    constexpr std::size_t most = 160;
    std::string text;
    for (std::size_t i = 0; i < names.size(); ++i) {
        if (text.size() > most)
            return text + between + "and " + std::to_string(names.size() - i) + " more";
        text += (i == 0 ? "" : between) + names[i];
    }
    return text;
}

// The packet without what stands between these tags.
std::string without(std::string_view open, std::string_view close, std::string_view packet) {
    std::string kept;
    std::size_t from = 0;
    for (std::size_t at = packet.find(open); at != std::string_view::npos; at = packet.find(open, from)) {
        const std::size_t last = packet.find(close, at);
        if (last == std::string_view::npos)
            break;
        kept += packet.substr(from, at - from);
        from = last + close.size();
    }
    return kept.append(packet.substr(from));
}

// @return whether the packet showed the picture as it was
bool eraseThumbnails(Bytes& packet) {
    const std::string kept = without("<xmp:Thumbnails", "</xmp:Thumbnails>",
                                     without("<xap:Thumbnails", "</xap:Thumbnails>", asText(packet)));
    if (kept.size() == packet.size())
        return false;
    packet = copyOf(asBytes(kept));
    return true;
}

/// Makes the metadata of one format ready for another.
class Preparation {
public:
    Preparation(const Metadata& source, FileFormat target, const PictureFacts& picture)
        : mSource(source), mPicture(picture), mExif(source.exif) {
        mResult.metadata = source;
        mResult.target = target;
        mResult.lost = source.unheld;
    }

    PreparedMetadata run() {
        adaptToPicture();
        if (mSource.format != FileFormat::Jpeg || mResult.target != FileFormat::Jpeg)
            dropSegments();
        if (mSource.format != FileFormat::Png || mResult.target != FileFormat::Png) {
            moveTexts();
            dropChunks();
        }
        moveResources();
        moveDensity();
        moveColors();
        if (mResult.target == FileFormat::Jpeg)
            fitJpeg();
        fitTiff();
        metadata().exif = mExif.bytes();
        return std::move(mResult);
    }

private:
    void adaptToPicture();
    void dropXmpThumbnails();
    void dropSegments();
    void dropChunks();
    void moveTexts();
    bool moveText(Text text);
    void moveResources();
    void moveDensity();
    void moveColors();
    void fitJpeg();
    void fitTiff();

    Metadata& metadata() { return mResult.metadata; }
    void lose(const std::string& name) { nameOnce(mResult.lost, name); }

    const Metadata& mSource;
    const PictureFacts& mPicture;
    ExifBlock mExif;
    PreparedMetadata mResult;
};

void Preparation::adaptToPicture() {
    mExif.setDimensions(mPicture.width, mPicture.height);
    const bool turned = mSource.format == FileFormat::Heif && mExif.orientation() >= 5;
    if (mSource.format == FileFormat::Heif) {
        mExif.makeUpright();
        static const std::regex property("(tiff:Orientation(?:=[\"']|>))[2-8]");
        const std::string upright = std::regex_replace(std::string(asText(mSource.xmp)), property, "$011");
        metadata().xmp = copyOf(asBytes(upright));
    }
    // A second directory of a TIFF would be a second page.
    const bool inExif = mResult.target == FileFormat::Tiff
                            ? !mExif.dropThumbnails()
                            : mExif.renewThumbnails(mPicture.makeThumbnail, turned);
    const bool inResources = renewResourceThumbnail(metadata().resources, mPicture.makeThumbnail);
    const bool inHeif = mSource.heifThumbnail == 0 || mResult.target == FileFormat::Heif;
    if (!inExif || !inResources || !inHeif)
        lose("the thumbnail");
    Bytes block = mExif.bytes();
    if (!renewNotePreviews(block, mPicture.makeThumbnail, turned))
        lose("the preview in the maker note");
    mExif = ExifBlock(std::move(block));
    dropXmpThumbnails();
}

// A long packet of a JPEG has them in further segments.
void Preparation::dropXmpThumbnails() {
    std::optional<Bytes> whole = joinXmp(metadata().xmp, metadata().segments);
    const bool parted = whole.has_value();
    Bytes packet = whole ? std::move(*whole) : metadata().xmp;
    if (!eraseThumbnails(packet))
        return;
    lose("the thumbnail");
    metadata().xmp = std::move(packet);
    if (parted)
        std::erase_if(metadata().segments, [](const Chunk& one) { return one.name == kExtendedXmp; });
}

void Preparation::dropSegments() {
    const std::optional<Bytes> xmp = joinXmp(metadata().xmp, metadata().segments);
    if (xmp)
        metadata().xmp = *xmp;
    for (const Chunk& segment : metadata().segments)
        if (!xmp || segment.name != kExtendedXmp)
            lose(segment.name);
    metadata().segments.clear();
}

// Of texts and colours others tell.
void Preparation::dropChunks() {
    Names names;
    for (const Chunk& chunk : mSource.chunks) {
        if (!isPngText(chunk.name) && !isPlainColour(chunk))
            names.push_back(chunk.name);
    }
    if (!names.empty())
        lose("PNG chunks " + joined(names, ", "));
    metadata().chunks.clear();
}

// Some cameras fill up a comment with zeros. Within a text few places hold one.
bool Preparation::moveText(Text text) {
    const bool bytes = text.keyword == kCommentKeyword && mResult.target == FileFormat::Jpeg;
    if (!bytes) {
        text.text.erase(text.text.find_last_not_of('\0') + 1);
        if (text.text.find('\0') != std::string::npos)
            return false;
    }
    if (mResult.target == FileFormat::Png || (bytes && text.text.size() <= kLongestComment)) {
        const bool plain = bytes && mSource.format == FileFormat::Jpeg;
        metadata().texts.push_back({text.keyword, plain ? text.text : toUtf8(text.text)});
        return true;
    }
    const std::uint16_t tag = tagOfKeyword(text.keyword);
    if (tag == 0 || mExif.isDamaged())
        return false;
    if (const std::optional<std::string> there = mExif.text(tag))
        return *there == text.text;
    Bytes value = copyOf(asBytes(text.text));
    value.push_back(0);
    mExif.add({{tag, tiff::Ascii, static_cast<std::uint32_t>(value.size()), std::move(value)}});
    return true;
}

void Preparation::moveTexts() {
    Names names;
    metadata().texts.clear();
    for (const Text& text : mSource.texts)
        if (!moveText(text))
            names.push_back(text.keyword);
    if (mSource.format == FileFormat::Png && !names.empty())
        lose("PNG texts " + joined(names, ", "));
    else if (!names.empty())
        lose("the comment");
}

void Preparation::moveResources() {
    if (mResult.target != FileFormat::WebP && mResult.target != FileFormat::Heif)
        return;
    const ImageResources resources = imageResources(mSource.resources);
    Names names;
    for (const ImageResource& one : resources.list)
        if (one.id == resource::Iptc)
            for (const std::string& name : iptcNames(one.data))
                nameOnce(names, name);
    if (resources.find(resource::Iptc) != nullptr)
        lose(names.empty() ? "IPTC" : "IPTC " + joined(names, ", "));
    const bool others = std::any_of(resources.list.begin(), resources.list.end(),
                                    [](const ImageResource& one) { return one.id != resource::Iptc; });
    if (others || !resources.rest.empty())
        lose("Photoshop's data");
    metadata().resources.clear();
}

// WebP and HEIF have no place of their own for it.
void Preparation::moveDensity() {
    if (!mSource.density || mResult.target == FileFormat::Jpeg || mResult.target == FileFormat::Png ||
        mResult.target == FileFormat::Tiff)
        return;
    if (mSource.density->unit != DensityUnit::None) {
        if (!mExif.setDensity(*mSource.density))
            lose("the density");
    } else if (mSource.density->x.value() != mSource.density->y.value()) {
        lose("the shape of its pixels");
    }
    metadata().density.reset();
}

// RGB samples have no matrix, and an ICC profile says more than codes.
void Preparation::moveColors() {
    if (!mSource.colors || mSource.format == mResult.target)
        return;
    const ColorCodes& codes = *mSource.colors;
    metadata().colors.reset();
    if (codes.isPlain() || mPicture.hasProfile)
        return;
    if (mResult.target == FileFormat::Png || mResult.target == FileFormat::Heif)
        metadata().colors = ColorCodes{codes.primaries, codes.transfer};
    else
        lose("the code of its colours (primaries " + std::to_string(codes.primaries) + ", transfer " +
             std::to_string(codes.transfer) + ")");
}

// Some cameras let a long block go on in further segments; few programs know of that.
void Preparation::fitJpeg() {
    const auto isLong = [this] {
        return mExif.bytes().size() > kJpegExifLimit && mSource.format != FileFormat::Jpeg;
    };
    if (isLong() && mExif.dropThumbnails())
        lose("the thumbnail");
    if (isLong()) {
        lose("the Exif data, of over 64 KiB");
        mExif = ExifBlock({});
    }
    if (metadata().xmp.size() <= kJpegXmpLimit)
        return;
    const Bytes packet = std::move(metadata().xmp);
    metadata().xmp.clear();
    if (std::optional<PartedXmp> parted = partXmp(packet)) {
        metadata().xmp = std::move(parted->main);
        std::move(parted->segments.begin(), parted->segments.end(), std::back_inserter(metadata().segments));
    } else {
        lose("the XMP data");
    }
}

void Preparation::fitTiff() {
    if (mResult.target == FileFormat::Tiff && mExif.isDamaged()) {
        lose("the Exif data, which are damaged");
        mExif = ExifBlock({});
    }
}

Names differences(const Metadata& wanted, const Metadata& found) {
    Names names;
    const auto check = [&](bool same, const char* name) {
        if (!same)
            names.emplace_back(name);
    };
    check(wanted.exif == found.exif, "the Exif data");
    check(wanted.xmp == found.xmp, "the XMP data");
    check(sameResources(wanted.resources, found.resources), "Photoshop's data");
    check(wanted.texts == found.texts, "the texts");
    check(wanted.segments == found.segments, "APPn segments");
    check(wanted.chunks.size() <= found.chunks.size(), "PNG chunks");
    check(!wanted.density || found.density, "the density");
    check(!wanted.colors || (found.colors && wanted.colors->looksLike(*found.colors)),
          "the code of its colours");
    return names;
}

} // namespace

PreparedMetadata prepareMetadata(const Metadata& source, FileFormat target, const PictureFacts& picture) {
    return Preparation(source, target, picture).run();
}

void embedMetadata(PreparedMetadata& prepared, Bytes& encoded) {
    const Metadata& metadata = prepared.metadata;
    switch (prepared.target) {
    case FileFormat::Jpeg:
        embedIntoJpeg(metadata, encoded);
        break;
    case FileFormat::Png:
        embedIntoPng(metadata, encoded);
        break;
    case FileFormat::WebP:
        embedIntoWebP(metadata, encoded);
        break;
    case FileFormat::Tiff:
    case FileFormat::Heif:
    case FileFormat::Psd:
        break;
    }
    for (const std::string& name : differences(metadata, readMetadata(encoded, prepared.target)))
        nameOnce(prepared.lost, name);
}

std::vector<std::string> metadataNotes(const PreparedMetadata& prepared) {
    std::vector<std::string> notes;
    const auto& damaged = prepared.metadata.damaged;
    if (!prepared.lost.empty())
        notes.push_back(std::string("the ") + formatName(prepared.target) +
                        " file cannot hold: " + joined(prepared.lost, "; "));
    if (!damaged.empty())
        notes.push_back("damaged, carried over as far as possible: " + joined(damaged, "; "));
    return notes;
}

} // namespace orvela
