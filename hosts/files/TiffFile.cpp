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
    mHasMore = mFile.look([&](ByteView bytes) {
        std::size_t at = 0;
        try {
            at = TiffView(bytes).first();
        } catch (const DamagedBytes&) {
            refuse(mFile.path(), "the file is cut short", kCopyAgain);
        }
        return follow(TiffView(bytes), at, wanted);
    });
}

// Whether there are more pages than wanted.
bool TiffFile::follow(const TiffView& tiff, std::size_t at, int wanted) {
    std::unordered_map<std::size_t, int> known;
    do {
        const auto [earlier, isNew] = known.emplace(at, pages());
        if (!isNew)
            refuse(mFile.path(),
                   "is damaged: " + ordinal(pages() - 1) + " leads back to " + ordinal(earlier->second),
                   kCopyAgain);
        mPlaces.push_back(at);
        at = directory(tiff, pages() - 1).next;
    } while (at != 0 && pages() < wanted);
    return at != 0;
}

TagDirectory TiffFile::directory(const TiffView& tiff, int index) const {
    try {
        return tiff.directory(place(index));
    } catch (const DamagedBytes&) {
        refusePage(index, "its directory is damaged or cut short");
    }
}

TiffPage TiffFile::page(int index) const {
    return mFile.look([&](ByteView bytes) {
        const TiffView tiff(bytes);
        TiffPage page;
        page.order = tiff.order();
        for (const TagEntry& entry : directory(tiff, index).entries)
            if (entry.value.empty())
                page.damaged.push_back(entry.tag);
            else if (entry.tag != TIFFTAG_IMAGESOURCEDATA) // layers, perhaps larger than the picture
                page.fields.push_back(tiffField(entry));
        return page;
    });
}

TiffPageStream TiffFile::alone(int index) const {
    return {mFile, mFile.look([&](ByteView bytes) {
                const TiffView tiff(bytes);
                Bytes to;
                append(to, place(index), tiff.offsetSize(), tiff.order());
                return std::vector<TiffPageStream::Link>{
                    {tiff.linkAt(), std::move(to)},
                    {directory(tiff, index).linkAt, Bytes(tiff.offsetSize())}};
            })};
}

bool TiffFile::isCameraRaw() const {
    return mFile.look([](ByteView bytes) { return orvela::isCameraRaw(TiffView(bytes)); });
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
        TiffPageStream stream = alone(index);
        TiffHandle tiff(stream, "rm");
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
