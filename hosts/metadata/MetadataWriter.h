#pragma once

#include "metadata/ExifBlock.h"
#include "metadata/Metadata.h"

namespace orvela {

/// The picture that metadata go with.
struct PictureFacts {
    int width = 0;
    int height = 0;
    ThumbnailMaker makeThumbnail; ///< of this picture
    bool hasProfile = false;      ///< an ICC profile goes with it
};

/// Metadata made ready for a file of one format.
struct PreparedMetadata {
    Metadata metadata;
    FileFormat target = FileFormat::Png;
    std::vector<std::string> lost; ///< what the target cannot hold, by names that users know
};

/// Adapts what belongs to the picture's edges, to its orientation (a HEIF is turned when it is decoded) and
/// to its looks (thumbnails), and moves to other places what the target has no place of its own for.
PreparedMetadata prepareMetadata(const Metadata& source, FileFormat target, const PictureFacts& picture);

/// Puts the metadata into an encoded picture, in place of what the encoder wrote, and reads it back. What did
/// not arrive joins what is lost. A HEIF's Exif and XMP must have been written by its encoder, a TIFF's by
/// TiffWriter.
void embedMetadata(PreparedMetadata& prepared, Bytes& encoded);

/// What there is to tell: at most one line about what is lost, one about what is damaged.
std::vector<std::string> metadataNotes(const PreparedMetadata& prepared);

} // namespace orvela
