#include "metadata/TiffMetadata.h"

#include "metadata/ExifBlock.h"
#include "metadata/ImageResources.h"
#include "metadata/TagDensity.h"
#include "metadata/TagLibrary.h"

#include <algorithm>
#include <map>
#include <optional>

namespace orvela {

namespace {

// A block with a maker note below it still fits into a JPEG.
constexpr std::size_t kNoteLimit = 60000;

bool isResolution(std::uint16_t tag) {
    return tag == tiff::XResolution || tag == tiff::YResolution || tag == tiff::ResolutionUnit;
}

/// Lays out directories and their values around a maker note that has to stay where it is.
class BlockBuilder {
public:
    BlockBuilder(ByteOrder order, const TagEntry* note) : mOrder(order) {
        mBytes = copyOf(asBytes(order == ByteOrder::Little ? "II" : "MM"));
        append(mBytes, 42, 2, order);
        mBytes.resize(mLow);
        if (note == nullptr)
            return;
        mNote = note->valueAt;
        mBytes.resize(mNote);
        append(mBytes, note->value);
        padToEven(mBytes);
        mHigh = mBytes.size();
    }

    /// Writes a directory; returns its place. The fields are sorted by tag.
    std::size_t write(std::vector<TagField> fields) {
        std::sort(fields.begin(), fields.end(),
                  [](const TagField& a, const TagField& b) { return a.tag < b.tag; });
        Bytes directory;
        append(directory, fields.size(), 2, mOrder);
        for (const TagField& field : fields) {
            append(directory, field.tag, 2, mOrder);
            append(directory, field.type, 2, mOrder);
            append(directory, field.count, 4, mOrder);
            if (field.value.size() > 4) {
                append(directory, isNote(field) ? mNote : place(field.value), 4, mOrder);
            } else {
                append(directory, field.value);
                directory.resize(directory.size() + 4 - field.value.size());
            }
        }
        append(directory, 0, 4, mOrder);
        return place(directory);
    }

    /// The block, whose first directory stands there.
    Bytes take(std::size_t first) {
        store(mBytes, 4, first, 4, mOrder);
        return std::move(mBytes);
    }

private:
    bool isNote(const TagField& field) const { return field.tag == tiff::MakerNote && mNote != 0; }

    std::size_t place(ByteView bytes) {
        std::size_t& cursor = mNote == 0 || mLow + bytes.size() <= mNote ? mLow : mHigh;
        const std::size_t at = cursor;
        if (mBytes.size() < at + bytes.size())
            mBytes.resize(at + bytes.size());
        std::copy(bytes.begin(), bytes.end(), mBytes.begin() + static_cast<std::ptrdiff_t>(at));
        cursor = (at + bytes.size() + 1) / 2 * 2;
        return at;
    }

    ByteOrder mOrder;
    Bytes mBytes;
    std::size_t mNote = 0; ///< its place; 0 when there is none that has to stay
    std::size_t mLow = 8;  ///< where room in front of it begins
    std::size_t mHigh = 0; ///< where room behind it begins
};

// Numbers of eight bytes, which only a BigTIFF has, in four.
TagField classic(const TiffView& view, const TagEntry& entry) {
    TagField field{entry.tag, narrowTagType(entry.type), static_cast<std::uint32_t>(entry.count),
                   copyOf(entry.value)};
    if (field.type == entry.type)
        return field;
    field.value.clear();
    for (std::size_t i = 0; i < entry.count; ++i)
        append(field.value, view.value(entry, i), 4, view.order());
    return field;
}

// Of the first directory what describes the picture.
std::vector<TagField> fieldsOf(const TiffView& view, const TagDirectory& directory, bool first) {
    std::vector<TagField> fields;
    for (const TagEntry& entry : directory.entries)
        if (!entry.value.empty() && !leadsToExif(entry.tag) && !(first && isTiffStructure(entry.tag)))
            fields.push_back(classic(view, entry));
    return fields;
}

// Adds the directory below the tag, if the page has one.
void addBelow(std::vector<TagField>& fields, std::uint16_t pointer, const std::vector<TagField>& below,
              BlockBuilder& builder, ByteOrder order) {
    if (below.empty())
        return;
    TagField field{pointer, tiff::Long, 1, {}};
    append(field.value, builder.write(below), 4, order);
    fields.push_back(std::move(field));
}

Bytes blockOf(const TiffView& view, const ExifDirectories& directories, const TagEntry* note) {
    const auto fields = [&](std::uint16_t pointer) {
        const TagDirectory* found = directories.find(pointer);
        return found == nullptr ? std::vector<TagField>() : fieldsOf(view, *found, pointer == 0);
    };
    std::vector<TagField> first = fields(0);
    std::vector<TagField> exif = fields(tiff::ExifIfd);
    BlockBuilder builder(view.order(), note);
    addBelow(exif, tiff::InteropIfd, fields(tiff::InteropIfd), builder, view.order());
    addBelow(first, tiff::ExifIfd, exif, builder, view.order());
    addBelow(first, tiff::GpsIfd, fields(tiff::GpsIfd), builder, view.order());
    const bool describes = std::any_of(first.begin(), first.end(),
                                       [](const TagField& field) { return !isResolution(field.tag); });
    return describes ? builder.take(builder.write(first)) : Bytes();
}

// Whether the note, if any, can stand in a block where it stands in the file.
bool keepsPlace(const TagEntry* note, const TiffView& view) {
    return note == nullptr || note->value.size() <= view.offsetSize() ||
           (note->valueAt >= view.headerSize() && note->valueAt + note->value.size() <= kNoteLimit);
}

void takeExif(const TiffView& view, const ExifDirectories& directories, Metadata& metadata) {
    const TagDirectory* exif = directories.find(tiff::ExifIfd);
    const TagEntry* note = exif == nullptr ? nullptr : exif->find(tiff::MakerNote);
    if (note != nullptr && note->value.size() <= 8)
        note = nullptr;
    if (keepsPlace(note, view)) {
        metadata.exif = blockOf(view, directories, note);
        return;
    }
    const bool isFirst = directories.find(0)->place == view.first();
    if (view.isBig() || !isFirst) {
        metadata.exif = blockOf(view, directories, nullptr);
        metadata.unheld.emplace_back("what the maker note refers to by its place");
        return;
    }
    RewrittenExif rewritten = rewriteTiffExif(view.bytes());
    metadata.exif = std::move(rewritten.block);
    metadata.unheld.insert(metadata.unheld.end(), rewritten.lost.begin(), rewritten.lost.end());
}

ByteView valueOf(const TagDirectory& directory, std::uint16_t tag) {
    const TagEntry* entry = directory.find(tag);
    return entry == nullptr ? ByteView() : entry->value;
}

// Some programs count its length in fours, with zeros behind the last record.
ByteView withoutPadding(ByteView iptc) {
    for (int i = 0; i < 3 && !iptc.empty() && iptc.back() == 0; ++i)
        iptc = iptc.first(iptc.size() - 1);
    return iptc;
}

// The tag goes before what Photoshop's list holds of the kind, often the same.
void takeResources(const TagDirectory& page, Metadata& metadata) {
    const ByteView iptc = withoutPadding(valueOf(page, tiff::Iptc));
    if (!iptc.empty())
        appendResource(metadata.resources, resource::Iptc, iptc);
    addResources(metadata.resources, valueOf(page, tiff::Resources));
}

} // namespace

Metadata readTiffMetadata(ByteView file, std::size_t page) {
    Metadata metadata;
    metadata.format = FileFormat::Tiff;
    try {
        const TiffView view(file);
        const ExifDirectories directories = exifDirectories(view, page != 0 ? page : view.first());
        const TagDirectory* first = directories.find(0);
        if (first == nullptr)
            throw DamagedBytes("there is no directory");
        metadata.xmp = copyOf(valueOf(*first, tiff::Xmp));
        takeResources(*first, metadata);
        metadata.density = densityOf(view, *first);
        if (first->find(tiff::Layers) != nullptr)
            metadata.unheld.emplace_back("the layers");
        if (first->find(tiff::SubIfds) != nullptr)
            metadata.unheld.emplace_back("the sub-images");
        takeExif(view, directories, metadata);
        if (!directories.complete)
            metadata.damaged.emplace_back("the Exif data");
    } catch (const DamagedBytes&) {
        metadata.damaged.emplace_back("the Exif data");
    }
    return metadata;
}

std::vector<TagField> tiffFields(const Metadata& metadata, ByteOrder order) {
    std::vector<TagField> fields;
    const auto add = [&](std::uint16_t tag, std::uint16_t type, Bytes value) {
        const auto count = static_cast<std::uint32_t>(value.size() / tagTypeSize(type));
        if (count > 0)
            fields.push_back({tag, type, count, std::move(value)});
    };
    add(tiff::Xmp, tiff::Byte, metadata.xmp);
    const ImageResources resources = imageResources(metadata.resources);
    const ImageResource* iptc = resources.find(resource::Iptc);
    if (iptc != nullptr) {
        Bytes padded = copyOf(iptc->data);
        padded.resize((padded.size() + 3) / 4 * 4);
        add(tiff::Iptc, tiff::Long, std::move(padded));
    }
    Bytes others;
    for (const ImageResource& one : resources.list)
        if (&one != iptc)
            append(others, one.whole);
    append(others, resources.rest);
    add(tiff::Resources, tiff::Byte, std::move(others));
    if (metadata.density)
        for (TagField& field : densityFields(*metadata.density, order))
            fields.push_back(std::move(field));
    return fields;
}

} // namespace orvela
