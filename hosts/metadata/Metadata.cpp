#include "metadata/Metadata.h"

namespace orvela {

const char* formatName(FileFormat format) {
    switch (format) {
    case FileFormat::Jpeg:
        return "JPEG";
    case FileFormat::Png:
        return "PNG";
    case FileFormat::Tiff:
        return "TIFF";
    case FileFormat::WebP:
        return "WebP";
    case FileFormat::Psd:
        return "PSD";
    case FileFormat::Heif:
        return "HEIF";
    }
    return "";
}

} // namespace orvela
