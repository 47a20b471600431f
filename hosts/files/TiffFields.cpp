#include "files/TiffFields.h"

#include "metadata/TiffMetadata.h"

#include <tiff.h>

#include <algorithm>
#include <array>
#include <cstdio>

namespace orvela {

namespace {

// How the samples of the old page were stored, and what held for their values only.
constexpr std::array kStorage = {
    TIFFTAG_IMAGEWIDTH,
    TIFFTAG_IMAGELENGTH,
    TIFFTAG_BITSPERSAMPLE,
    TIFFTAG_COMPRESSION,
    TIFFTAG_PHOTOMETRIC,
    TIFFTAG_THRESHHOLDING,
    TIFFTAG_CELLWIDTH,
    TIFFTAG_CELLLENGTH,
    TIFFTAG_FILLORDER,
    TIFFTAG_STRIPOFFSETS,
    TIFFTAG_SAMPLESPERPIXEL,
    TIFFTAG_ROWSPERSTRIP,
    TIFFTAG_STRIPBYTECOUNTS,
    TIFFTAG_MINSAMPLEVALUE,
    TIFFTAG_MAXSAMPLEVALUE,
    TIFFTAG_PLANARCONFIG,
    TIFFTAG_FREEOFFSETS,
    TIFFTAG_FREEBYTECOUNTS,
    TIFFTAG_GRAYRESPONSEUNIT,
    TIFFTAG_GRAYRESPONSECURVE,
    TIFFTAG_GROUP3OPTIONS,
    TIFFTAG_GROUP4OPTIONS,
    TIFFTAG_PREDICTOR,
    TIFFTAG_COLORMAP,
    TIFFTAG_TILEWIDTH,
    TIFFTAG_TILELENGTH,
    TIFFTAG_TILEOFFSETS,
    TIFFTAG_TILEBYTECOUNTS,
    TIFFTAG_EXTRASAMPLES,
    TIFFTAG_SAMPLEFORMAT,
    TIFFTAG_SMINSAMPLEVALUE,
    TIFFTAG_SMAXSAMPLEVALUE,
    TIFFTAG_INDEXED,
    TIFFTAG_JPEGTABLES,
    TIFFTAG_JPEGPROC,
    TIFFTAG_JPEGIFOFFSET,
    TIFFTAG_JPEGIFBYTECOUNT,
    TIFFTAG_JPEGRESTARTINTERVAL,
    TIFFTAG_JPEGQTABLES,
    TIFFTAG_JPEGDCTABLES,
    TIFFTAG_JPEGACTABLES,
    TIFFTAG_YCBCRCOEFFICIENTS,
    TIFFTAG_YCBCRSUBSAMPLING,
    TIFFTAG_YCBCRPOSITIONING,
    TIFFTAG_REFERENCEBLACKWHITE,
};

bool isStorage(std::uint16_t tag) {
    return std::find(kStorage.begin(), kStorage.end(), tag) != kStorage.end();
}

bool leadsAway(const TiffField& field) {
    return leadsToExif(field.tag) || field.tag == TIFFTAG_SUBIFD || field.type == TIFF_IFD ||
           field.type == TIFF_IFD8;
}

std::string hexadecimal(std::uint16_t tag) {
    std::array<char, 8> text{};
    std::snprintf(text.data(), text.size(), "0x%04X", unsigned{tag});
    return text.data();
}

void add(std::vector<TiffField>& fields, TiffField field) {
    const auto same = [&](const TiffField& other) { return other.tag == field.tag; };
    if (std::none_of(fields.begin(), fields.end(), same))
        fields.push_back(std::move(field));
}

std::vector<TiffField> fieldsOf(const TagDirectory& directory) {
    std::vector<TiffField> fields;
    for (const TagEntry& entry : directory.entries)
        if (!entry.value.empty() && !leadsToExif(entry.tag))
            fields.push_back(tiffField(entry));
    return fields;
}

// What an Exif block says, with the directories below its first one.
void addBlock(std::vector<TiffField>& fields, const Bytes& block) {
    if (block.empty())
        return;
    const TiffView view(block);
    const ExifDirectories directories = exifDirectories(view, view.first());
    const auto below = [&](std::uint16_t pointer) -> TiffField {
        const TagDirectory* found = directories.find(pointer);
        return {pointer, TIFF_LONG, {}, 0, found == nullptr ? std::vector<TiffField>() : fieldsOf(*found)};
    };
    TiffField exif = below(TIFFTAG_EXIFIFD);
    if (TiffField interoperability = below(TIFFTAG_INTEROPERABILITYIFD); !interoperability.below.empty())
        exif.below.push_back(std::move(interoperability));
    for (TiffField& field : fieldsOf(*directories.find(0)))
        if (!isTiffStructure(field.tag))
            add(fields, std::move(field));
    for (const TiffField& pointer : {exif, below(TIFFTAG_GPSIFD)})
        if (!pointer.below.empty())
            add(fields, pointer);
}

// What has been read as metadata, and may have been left out since.
bool isMetadata(std::uint16_t tag) {
    return tag == tiff::Xmp || tag == tiff::Iptc || tag == tiff::Resources || tag == tiff::IccProfile;
}

// What metadata do not speak of: which page it is, its inks, ...
void addRest(std::vector<TiffField>& fields, const TiffPage& page, std::vector<std::string>& lost) {
    for (const TiffField& field : page.fields) {
        if (isStorage(field.tag) || isMetadata(field.tag) || leadsToExif(field.tag) ||
            field.tag == TIFFTAG_SUBIFD)
            continue; // metadata tell of the last
        if (leadsAway(field))
            lost.push_back("what the tag " + hexadecimal(field.tag) + " leads to");
        else
            add(fields, field);
    }
    for (const std::uint16_t tag : page.damaged)
        if (!isStorage(tag))
            lost.push_back("the damaged tag " + hexadecimal(tag));
}

} // namespace

std::vector<TiffField> pageFields(const Photograph& photograph, const Metadata& metadata, ByteOrder order,
                                  std::vector<std::string>& lost) {
    std::vector<TiffField> fields;
    for (const TagField& field : tiffFields(metadata, order))
        fields.push_back({field.tag, field.type, field.value});
    addBlock(fields, metadata.exif);
    if (!photograph.iccProfile.empty())
        add(fields, {TIFFTAG_ICCPROFILE, TIFF_UNDEFINED, photograph.iccProfile});
    if (photograph.tiffPage)
        addRest(fields, *photograph.tiffPage, lost);
    return fields;
}

std::vector<TiffField> copiedFields(const TiffPage& page, std::vector<std::string>& lost) {
    std::vector<TiffField> fields;
    for (const TiffField& field : page.fields)
        if (leadsAway(field))
            lost.push_back("what the tag " + hexadecimal(field.tag) + " leads to");
        else
            fields.push_back(field);
    return fields;
}

} // namespace orvela
