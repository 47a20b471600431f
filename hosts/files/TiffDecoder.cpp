#include "files/TiffDecoder.h"

#include "files/Refusal.h"
#include "files/VipsPhotograph.h"
#include "files/VipsStream.h"

namespace orvela {

namespace {

namespace fs = std::filesystem;

VipsHandle open(VipsStream& stream, const fs::path& path) {
    vips_error_clear();
    VipsImage* opened = nullptr;
    vips_tiffload_source(stream.source(), &opened, "access", VIPS_ACCESS_SEQUENTIAL, "fail_on",
                         VIPS_FAIL_ON_TRUNCATED, nullptr);
    if (opened == nullptr)
        refuseUnread(path, takeVipsError());
    return VipsHandle(opened);
}

Photograph decode(VipsStream& stream, const fs::path& path) {
    const VipsHandle image = open(stream, path);
    Photograph photograph = describeImage(path, image.get());
    takeSamples(photograph, path, image.get());
    return photograph;
}

} // namespace

// The library tells what stopped the stream in its own words, and lazily: while samples are taken.
Photograph decodeTiff(TiffStream& tiff, const fs::path& path) {
    VipsStream stream(tiff);
    try {
        Photograph photograph = decode(stream, path);
        stream.check();
        return photograph;
    } catch (...) {
        stream.check();
        throw;
    }
}

} // namespace orvela
