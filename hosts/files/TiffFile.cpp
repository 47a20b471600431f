#include "files/TiffFile.h"

#include "files/CameraRaw.h"
#include "files/LibTiff.h"
#include "files/Refusal.h"

#include <algorithm>
#include <array>
#include <unordered_map>

namespace orvela {

namespace {

namespace fs = std::filesystem;

std::string ordinal(int index) {
    return "page " + std::to_string(index + 1);
}

class SourceStream : public TiffStream {
public:
    explicit SourceStream(const SourceFile& file) : mFile(file) {}

    std::size_t read(std::uint64_t at, std::span<std::uint8_t> to) override {
        const std::uint64_t first = std::min(at, mFile.size());
        const Bytes bytes = mFile.read(first, std::min<std::uint64_t>(to.size(), mFile.size() - first));
        std::copy(bytes.begin(), bytes.end(), to.begin());
        return bytes.size();
    }
    void write(std::uint64_t, ByteView) override {} // never asked for by a handle for reading
    std::uint64_t size() const override { return mFile.size(); }

private:
    const SourceFile& mFile;
};

// libtiff's conversion to RGB, which has an end of its own.
class RgbConversion {
public:
    explicit RgbConversion(TIFF* tiff) {
        std::array<char, 1024> cause{};
        if (TIFFRGBAImageOK(tiff, cause.data()) == 0 ||
            TIFFRGBAImageBegin(&mImage, tiff, 1, cause.data()) == 0)
            throw TiffError(cause.data());
        mImage.req_orientation = mImage.orientation; // rows in the order of the file
    }
    ~RgbConversion() { TIFFRGBAImageEnd(&mImage); }
    RgbConversion(const RgbConversion&) = delete;
    RgbConversion& operator=(const RgbConversion&) = delete;

    std::uint32_t width() const { return mImage.width; }
    std::uint32_t height() const { return mImage.height; }

    /// Rows from `first` on as packed pixels of libtiff.
    bool get(std::uint32_t first, std::vector<std::uint32_t>& pixels) {
        mImage.row_offset = static_cast<int>(first);
        const auto rows = static_cast<std::uint32_t>(pixels.size() / mImage.width);
        return TIFFRGBAImageGet(&mImage, pixels.data(), mImage.width, rows) == 1;
    }

private:
    TIFFRGBAImage mImage{};
};

} // namespace

TiffFile::TiffFile(SourceFile& file, int wanted) : mFile(file) {
    std::size_t at = 0;
    try {
        at = TiffView(mFile.view()).first();
    } catch (const DamagedBytes&) {
        refuse(file.path(), "the file is cut short", kCopyAgain);
    }
    std::unordered_map<std::size_t, int> known;
    do {
        const auto [earlier, isNew] = known.emplace(at, pages());
        if (!isNew)
            refuse(file.path(),
                   "is damaged: " + ordinal(pages() - 1) + " leads back to " + ordinal(earlier->second),
                   kCopyAgain);
        mPlaces.push_back(at);
        at = directory(pages() - 1).next;
    } while (at != 0 && pages() < wanted);
    mHasMore = at != 0;
}

TagDirectory TiffFile::directory(int index) const {
    try {
        return TiffView(mFile.view()).directory(place(index));
    } catch (const DamagedBytes&) {
        refusePage(index, "its directory is damaged or cut short");
    }
}

TiffPage TiffFile::page(int index) const {
    TiffPage page;
    page.order = TiffView(mFile.view()).order();
    for (const TagEntry& entry : directory(index).entries)
        if (entry.value.empty())
            page.damaged.push_back(entry.tag);
        else if (entry.tag != TIFFTAG_IMAGESOURCEDATA) // layers, perhaps larger than the picture
            page.fields.push_back(tiffField(entry));
    return page;
}

bool TiffFile::isCameraRaw() const {
    return orvela::isCameraRaw(TiffView(mFile.view()));
}

bool TiffFile::isMask(const TiffPage& page) {
    return (page.number(TIFFTAG_SUBFILETYPE, 0) & FILETYPE_MASK) != 0 ||
           page.number(TIFFTAG_PHOTOMETRIC, PHOTOMETRIC_MINISBLACK) == PHOTOMETRIC_MASK;
}

std::vector<Bytes> TiffFile::readBlocks(const TiffPage& page, int index, std::size_t wanted) const {
    const bool tiled = page.find(TIFFTAG_TILEOFFSETS) != nullptr;
    const auto offsets = page.numbers(tiled ? TIFFTAG_TILEOFFSETS : TIFFTAG_STRIPOFFSETS);
    const auto sizes = page.numbers(tiled ? TIFFTAG_TILEBYTECOUNTS : TIFFTAG_STRIPBYTECOUNTS);
    if (offsets.empty() || offsets.size() != sizes.size())
        refusePage(index, "is damaged");
    std::vector<Bytes> blocks;
    std::uint64_t total = 0;
    for (std::size_t i = 0; i < std::min(wanted, offsets.size()); ++i) {
        total += sizes[i];
        if (total > mFile.size() || offsets[i] > mFile.size() || sizes[i] > mFile.size() - offsets[i])
            refusePage(index, "is cut short");
        blocks.push_back(mFile.read(offsets[i], sizes[i]));
    }
    return blocks;
}

Bytes TiffFile::readRgb(int index) const {
    try {
        SourceStream stream(mFile);
        TiffHandle tiff(stream, "rhm");
        tiff.check(TIFFSetSubDirectory(tiff.get(), place(index)) == 1);
        RgbConversion image(tiff.get());
        std::uint32_t step = 0;
        if (TIFFGetField(tiff.get(), TIFFTAG_TILELENGTH, &step) == 0)
            TIFFGetFieldDefaulted(tiff.get(), TIFFTAG_ROWSPERSTRIP, &step);
        step = std::clamp<std::uint32_t>(step, 1, image.height());
        Bytes rgb;
        rgb.reserve(std::size_t{3} * image.width() * image.height());
        for (std::uint32_t row = 0; row < image.height(); row += step) {
            std::vector<std::uint32_t> pixels(std::size_t{image.width()} *
                                              std::min(step, image.height() - row));
            tiff.check(image.get(row, pixels));
            for (const std::uint32_t pixel : pixels)
                rgb.insert(rgb.end(), {static_cast<std::uint8_t>(TIFFGetR(pixel)),
                                       static_cast<std::uint8_t>(TIFFGetG(pixel)),
                                       static_cast<std::uint8_t>(TIFFGetB(pixel))});
        }
        return rgb;
    } catch (const TiffError& error) {
        refuseUnread(pageName(index), error.what());
    }
}

fs::path TiffFile::pageName(int index) const {
    fs::path name = mFile.path();
    if (index > 0 || pages() > 1)
        name += ": " + ordinal(index);
    return name;
}

void TiffFile::refusePage(int index, const std::string& cause) const {
    refuse(pageName(index), cause, kCopyAgain);
}

} // namespace orvela
