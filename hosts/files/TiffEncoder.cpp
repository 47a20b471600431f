#include "files/TiffEncoder.h"

#include "files/LibTiff.h"

#include <algorithm>
#include <limits>

namespace orvela {

namespace {

constexpr std::size_t kStripBytes = 1 << 18;
constexpr std::uint32_t kStripStep = 16; // rows; JPEG compression works on squares of up to that

// The target as libtiff sees it: a BigTIFF without pages. What it appends goes to the file, except its header
// and, from keepDirectory() on, its directory, which follows the header in memory.
class BlockStream : public TiffStream {
public:
    BlockStream(TargetFile& file, ByteOrder order, const std::atomic<bool>* stop) : mFile(file), mStop(stop) {
        append(mMemory, order == ByteOrder::Little ? "II" : "MM");
        append(mMemory, 43, 2, order);
        append(mMemory, 8, 2, order);
        mMemory.resize(kHeaderSize);
    }

    void keepDirectory() { mKeeps = true; }

    /// The header and the kept directory: a TIFF without samples.
    const Bytes& kept() const { return mMemory; }

    std::size_t read(std::uint64_t at, std::span<std::uint8_t> to) override {
        const std::size_t there =
            at < mMemory.size() ? std::min<std::size_t>(to.size(), mMemory.size() - at) : 0;
        std::copy_n(mMemory.begin() + static_cast<std::ptrdiff_t>(at), there, to.begin());
        return there;
    }

    void write(std::uint64_t at, ByteView bytes) override {
        if (!mKeeps && at >= kHeaderSize) {
            mFile.write(bytes, mStop);
            return;
        }
        mMemory.resize(std::max<std::size_t>(mMemory.size(), at + bytes.size()));
        std::copy(bytes.begin(), bytes.end(), mMemory.begin() + static_cast<std::ptrdiff_t>(at));
    }

    std::uint64_t size() const override { return mKeeps ? mMemory.size() : mFile.size(); }

private:
    static constexpr std::size_t kHeaderSize = 16;

    TargetFile& mFile;
    const std::atomic<bool>* mStop;
    Bytes mMemory;
    bool mKeeps = false;
};

// The part of a picture that one strip or tile of one plane holds.
struct Block {
    std::uint32_t left;
    std::uint32_t top;
    std::uint32_t width; ///< of a tile perhaps beyond the picture's edge
    std::uint32_t height;
    int firstSample; ///< of a pixel
    int samples;
};

// A picture's samples on their way into the file.
template <typename Sample>
class SampleCopy {
public:
    SampleCopy(const Photograph& photograph, const TiffStorage& storage)
        : mSamples(reinterpret_cast<const Sample*>(photograph.samples.data())),
          mWidth(static_cast<std::uint32_t>(photograph.width)),
          mHeight(static_cast<std::uint32_t>(photograph.height)),
          mPerPixel(samplesPerPixel(photograph.model)),
          mInverted(storage.photometric == PHOTOMETRIC_MINISWHITE),
          mMultiplied(hasAlpha(photograph.model) && storage.extraSample == EXTRASAMPLE_ASSOCALPHA) {}

    /// Beyond the edges nought.
    Bytes of(const Block& block) const {
        Bytes bytes(std::size_t{block.width} * block.height * static_cast<std::size_t>(block.samples) *
                    sizeof(Sample));
        const std::uint32_t right = std::min(block.left + block.width, mWidth);
        const std::uint32_t bottom = std::min(block.top + block.height, mHeight);
        for (std::uint32_t y = block.top; y < bottom; ++y) {
            auto* to = reinterpret_cast<Sample*>(bytes.data()) +
                       std::size_t{y - block.top} * block.width * static_cast<std::size_t>(block.samples);
            const Sample* pixel =
                mSamples + (std::size_t{y} * mWidth + block.left) * static_cast<std::size_t>(mPerPixel);
            for (std::uint32_t x = block.left; x < right; ++x, pixel += mPerPixel)
                for (int i = block.firstSample; i < block.firstSample + block.samples; ++i)
                    *to++ = stored(pixel, i);
        }
        return bytes;
    }

private:
    static constexpr std::uint32_t kMost = std::numeric_limits<Sample>::max();

    // Reading divides colours by a transparency that is multiplied in, rounding down; rounding up here gives
    // what was there.
    Sample stored(const Sample* pixel, int index) const {
        std::uint32_t value = pixel[index];
        if (mMultiplied && index < mPerPixel - 1)
            value =
                static_cast<std::uint32_t>((std::uint64_t{value} * pixel[mPerPixel - 1] + kMost - 1) / kMost);
        return static_cast<Sample>(mInverted && index == 0 ? kMost - value : value);
    }

    const Sample* mSamples;
    std::uint32_t mWidth;
    std::uint32_t mHeight;
    int mPerPixel;
    bool mInverted;
    bool mMultiplied;
};

Bytes samplesOf(const Photograph& photograph, const TiffStorage& storage, const Block& block) {
    return photograph.depth == 8 ? SampleCopy<std::uint8_t>(photograph, storage).of(block)
                                 : SampleCopy<std::uint16_t>(photograph, storage).of(block);
}

// The encoder of one picture.
class Blocks {
public:
    Blocks(TiffHandle& tiff, const Photograph& photograph, const TiffStorage& storage)
        : mTiff(tiff), mPhotograph(photograph), mStorage(storage),
          mPlanes(storage.separate ? samplesPerPixel(photograph.model) : 1) {}

    void describe();
    void encode();

private:
    void describeLayout();
    bool isTiled() const { return mStorage.tileWidth > 0 && mStorage.tileHeight > 0; }
    std::uint32_t width() const { return static_cast<std::uint32_t>(mPhotograph.width); }
    std::uint32_t height() const { return static_cast<std::uint32_t>(mPhotograph.height); }

    TiffHandle& mTiff;
    const Photograph& mPhotograph;
    const TiffStorage& mStorage;
    const int mPlanes;
    std::uint32_t mBlockWidth = 0;
    std::uint32_t mBlockHeight = 0;
};

void Blocks::describe() {
    const int samples = samplesPerPixel(mPhotograph.model);
    mTiff.set(TIFFTAG_IMAGEWIDTH, width());
    mTiff.set(TIFFTAG_IMAGELENGTH, height());
    mTiff.set(TIFFTAG_BITSPERSAMPLE, mPhotograph.depth);
    mTiff.set(TIFFTAG_SAMPLESPERPIXEL, samples);
    mTiff.set(TIFFTAG_COMPRESSION, int{mStorage.compression});
    mTiff.set(TIFFTAG_PHOTOMETRIC, int{mStorage.photometric});
    mTiff.set(TIFFTAG_PLANARCONFIG, mStorage.separate ? PLANARCONFIG_SEPARATE : PLANARCONFIG_CONTIG);
    if (hasAlpha(mPhotograph.model))
        mTiff.set(TIFFTAG_EXTRASAMPLES, 1, &mStorage.extraSample);
    if (mStorage.predictor != 0)
        mTiff.set(TIFFTAG_PREDICTOR, int{mStorage.predictor});
    if (mStorage.compression == COMPRESSION_JPEG)
        mTiff.set(TIFFTAG_JPEGQUALITY, mStorage.quality);
    if (mStorage.photometric == PHOTOMETRIC_YCBCR) {
        mTiff.set(TIFFTAG_JPEGCOLORMODE, JPEGCOLORMODE_RGB);
        mTiff.set(TIFFTAG_YCBCRSUBSAMPLING, int{mStorage.chroma[0]}, int{mStorage.chroma[1]});
    }
    describeLayout();
}

void Blocks::describeLayout() {
    if (isTiled()) {
        mBlockWidth = mStorage.tileWidth;
        mBlockHeight = mStorage.tileHeight;
        mTiff.set(TIFFTAG_TILEWIDTH, mBlockWidth);
        mTiff.set(TIFFTAG_TILELENGTH, mBlockHeight);
        return;
    }
    const std::size_t row = mPhotograph.samples.size() / height() / static_cast<std::size_t>(mPlanes);
    const auto steps = static_cast<std::uint32_t>(kStripBytes / row / kStripStep);
    mBlockWidth = width();
    mBlockHeight = std::min(std::max(steps, 1U) * kStripStep, height());
    mTiff.set(TIFFTAG_ROWSPERSTRIP, mBlockHeight);
}

void Blocks::encode() {
    const int samples = samplesPerPixel(mPhotograph.model) / mPlanes;
    std::uint32_t index = 0;
    for (int plane = 0; plane < mPlanes; ++plane)
        for (std::uint32_t top = 0; top < height(); top += mBlockHeight)
            for (std::uint32_t left = 0; left < width(); left += mBlockWidth, ++index) {
                const std::uint32_t rows = isTiled() ? mBlockHeight : std::min(mBlockHeight, height() - top);
                Bytes bytes = samplesOf(mPhotograph, mStorage,
                                        {left, top, mBlockWidth, rows, plane * samples, samples});
                const auto size = static_cast<tmsize_t>(bytes.size());
                mTiff.check((isTiled() ? TIFFWriteEncodedTile(mTiff.get(), index, bytes.data(), size)
                                       : TIFFWriteEncodedStrip(mTiff.get(), index, bytes.data(), size)) >= 0);
            }
}

} // namespace

std::vector<TiffField> encodeTiffBlocks(TargetFile& file, const Photograph& photograph,
                                        const TiffStorage& storage, ByteOrder order,
                                        const std::atomic<bool>* stop) {
    BlockStream stream(file, order, stop);
    TiffHandle tiff(stream, "a");
    Blocks blocks(tiff, photograph, storage);
    blocks.describe();
    blocks.encode();
    tiff.check(TIFFFlushData(tiff.get()) == 1);
    stream.keepDirectory();
    tiff.check(TIFFWriteDirectory(tiff.get()) == 1);
    const TiffView view(stream.kept());
    std::vector<TiffField> fields;
    for (const TagEntry& entry : view.directory(view.first()).entries) {
        TiffField field = tiffField(entry);
        const bool dependsOnForm = field.tag == TIFFTAG_STRIPOFFSETS ||
                                   field.tag == TIFFTAG_STRIPBYTECOUNTS || field.tag == TIFFTAG_TILEOFFSETS ||
                                   field.tag == TIFFTAG_TILEBYTECOUNTS;
        if (dependsOnForm)
            field = tiffField(field.tag, TIFF_LONG8, tiffNumbers(field, order), order);
        field.offset = 0;
        fields.push_back(std::move(field));
    }
    return fields;
}

} // namespace orvela
