#include "metadata/MetadataReader.h"

#include "metadata/ExifBlock.h"
#include "metadata/HeifMetadata.h"
#include "metadata/ImageResources.h"
#include "metadata/JpegMetadata.h"
#include "metadata/PngMetadata.h"
#include "metadata/PsdMetadata.h"
#include "metadata/TagLibrary.h"
#include "metadata/TiffMetadata.h"
#include "metadata/WebPMetadata.h"

namespace orvela {

namespace {

Metadata readContainer(ByteView file, FileFormat format, std::size_t page) {
    switch (format) {
    case FileFormat::Jpeg:
        return readJpegMetadata(file);
    case FileFormat::Png:
        return readPngMetadata(file);
    case FileFormat::Tiff:
        return readTiffMetadata(file, page);
    case FileFormat::WebP:
        return readWebPMetadata(file);
    case FileFormat::Psd:
        return readPsdMetadata(file);
    case FileFormat::Heif:
        return readHeifMetadata(file);
    }
    return {};
}

} // namespace

Metadata readMetadata(ByteView file, FileFormat format, std::size_t page) {
    Metadata metadata = readContainer(file, format, page);
    if (ExifBlock(metadata.exif).isDamaged())
        nameOnce(metadata.damaged, "the Exif data");
    if (!imageResources(metadata.resources).rest.empty())
        nameOnce(metadata.damaged, "Photoshop's data");
    if (!metadata.xmp.empty() && !isWellFormedXmp(metadata.xmp))
        nameOnce(metadata.damaged, "the XMP data");
    return metadata;
}

std::optional<Density> densityOf(const Metadata& metadata) {
    return metadata.density ? metadata.density : ExifBlock(metadata.exif).density();
}

} // namespace orvela
