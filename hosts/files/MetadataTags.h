#pragma once

#include "files/Metadata.h"

#include <exception>
#include <exiv2/exiv2.hpp>
#include <memory>

namespace orvela {

/// The metadata of a file, decoded.
struct Tags {
    Exiv2::ExifData exif;
    Exiv2::IptcData iptc;
    std::string xmp; ///< the packet as it stands
    std::string comment;
};

struct Metadata {
    Tags tags;
    FileFormat format = FileFormat::Png; ///< of the file that the tags come from
    std::exception_ptr failure;          ///< why they could not be read
};

/// Changes a tag where there is one.
template <typename Number>
void setIfPresent(Exiv2::ExifData& exif, const char* key, Number value) {
    const auto found = exif.findKey(Exiv2::ExifKey(key));
    if (found != exif.end())
        *found = value;
}

/// The file as the metadata library sees it; refers to the bytes. Not for HEIF.
/// @throws std::exception
std::unique_ptr<Exiv2::Image> openImage(ByteView file);

/// All tags of a file.
/// @throws std::exception when they are damaged
Tags readTags(ByteView file, FileFormat format);

} // namespace orvela
