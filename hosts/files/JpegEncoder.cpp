#include "files/JpegEncoder.h"

#include "files/JpegErrors.h"

#include <jerror.h>

#include <algorithm>
#include <cmath>
#include <new>
#include <numeric>

namespace orvela {

namespace {

namespace fs = std::filesystem;

constexpr int kQuality = 92;
constexpr std::size_t kLongestProfile = std::size_t{255} * (65533 - 14); // parts are numbered by a byte
constexpr int kMostBlocks = 10;                                          // of all components in one scan

/// Encoded bytes, handed to the library in pieces.
class Output {
public:
    Output() {
        mManager.base.init_destination = [](j_compress_ptr jpeg) { of(jpeg).offer(); };
        mManager.base.empty_output_buffer = [](j_compress_ptr jpeg) -> boolean {
            of(jpeg).take(jpeg, kPiece);
            of(jpeg).offer();
            return TRUE;
        };
        mManager.base.term_destination = [](j_compress_ptr jpeg) {
            of(jpeg).take(jpeg, kPiece - of(jpeg).mManager.base.free_in_buffer);
        };
        mManager.output = this;
    }
    Output(const Output&) = delete;
    Output& operator=(const Output&) = delete;

    jpeg_destination_mgr* manager() { return &mManager.base; }
    Bytes& bytes() { return mBytes; }

private:
    static constexpr std::size_t kPiece = 1 << 16;

    struct Manager {
        jpeg_destination_mgr base; // the first, since the library knows only this part
        Output* output;
    };

    static Output& of(j_compress_ptr jpeg) { return *reinterpret_cast<Manager*>(jpeg->dest)->output; }

    void offer() {
        mManager.base.next_output_byte = mPiece.data();
        mManager.base.free_in_buffer = kPiece;
    }

    // No exception may cross the library, which is C.
    bool append(std::size_t size) noexcept {
        try {
            mBytes.insert(mBytes.end(), mPiece.begin(), mPiece.begin() + static_cast<std::ptrdiff_t>(size));
            return true;
        } catch (const std::bad_alloc&) {
            return false;
        }
    }
    void take(j_compress_ptr jpeg, std::size_t size) {
        if (!append(size))
            ERREXIT1(jpeg, JERR_OUT_OF_MEMORY, 0);
    }

    Manager mManager{};
    Bytes mPiece = Bytes(kPiece);
    Bytes mBytes;
};

JpegLayout plainLayout(ColorModel model) {
    using enum JpegLayout::Color;
    JpegLayout layout;
    layout.color = model == ColorModel::Grey ? Grey : model == ColorModel::Cmyk ? Cmyk : YCbCr;
    layout.adobeMarker = true;
    layout.components.resize(static_cast<std::size_t>(samplesPerPixel(model)));
    return layout;
}

// Colour at full or half resolution. Only brightness and colour that are stored apart can differ in it.
void setChroma(JpegLayout& layout, bool half) {
    using enum JpegLayout::Color;
    if (half && layout.color == Rgb)
        layout.color = YCbCr;
    if (half && layout.color == Cmyk)
        layout.color = Ycck;
    for (std::size_t i = 0; i < layout.components.size(); ++i) {
        JpegLayout::Component& component = layout.components[i];
        const bool finer = half && layout.color != Grey && i % 3 == 0;
        component.horizontal = component.vertical = finer ? 2 : 1;
    }
}

// Factors without a common divisor: some files multiply all of them.
void reduceFactors(JpegLayout& layout) {
    int horizontal = 0;
    int vertical = 0;
    for (const JpegLayout::Component& component : layout.components) {
        horizontal = std::gcd(horizontal, component.horizontal);
        vertical = std::gcd(vertical, component.vertical);
    }
    for (JpegLayout::Component& component : layout.components) {
        component.horizontal /= std::max(1, horizontal);
        component.vertical /= std::max(1, vertical);
    }
}

// A file may give a number to one table after the other; here all stand side by side.
void separateTables(JpegLayout& layout) {
    auto& components = layout.components;
    const bool ambiguous = std::any_of(components.begin(), components.end(), [&](const auto& a) {
        return std::any_of(components.begin(), components.end(),
                           [&](const auto& b) { return a.table == b.table && a.quantizer != b.quantizer; });
    });
    for (std::size_t i = 0; ambiguous && i < components.size(); ++i)
        components[i].table = static_cast<int>(i);
}

JpegLayout layoutFor(const Photograph& photograph, const WriteOptions& options) {
    JpegLayout layout = photograph.encoding.jpeg ? *photograph.encoding.jpeg : plainLayout(photograph.model);
    if (options.chromaSubsampled)
        setChroma(layout, *options.chromaSubsampled);
    reduceFactors(layout);
    separateTables(layout);
    return layout;
}

J_COLOR_SPACE spaceOf(JpegLayout::Color color) {
    switch (color) {
    case JpegLayout::Color::Grey:
        return JCS_GRAYSCALE;
    case JpegLayout::Color::Rgb:
        return JCS_RGB;
    case JpegLayout::Color::Cmyk:
        return JCS_CMYK;
    case JpegLayout::Color::Ycck:
        return JCS_YCCK;
    case JpegLayout::Color::YCbCr:
        break;
    }
    return JCS_YCbCr;
}

class Encoder {
public:
    Encoder(const Photograph& photograph, const fs::path& target, const WriteOptions& options)
        : mPhotograph(photograph), mTarget(target), mLayout(layoutFor(photograph, options)),
          mQuality(options.quality > 0 || photograph.encoding.jpeg ? options.quality : kQuality),
          mProgressive(options.progressive.value_or(photograph.encoding.format == FileFormat::Jpeg &&
                                                    photograph.encoding.progressive)),
          mRow(rowBytes()) {
        mJpeg.err = mErrors.manager();
        mWatch.base.progress_monitor = watch;
        mWatch.stop = options.stop;
    }
    ~Encoder() { jpeg_destroy_compress(&mJpeg); }
    Encoder(const Encoder&) = delete;
    Encoder& operator=(const Encoder&) = delete;

    Bytes encode();

private:
    struct Watch {
        jpeg_progress_mgr base; // the first, since the library knows only this part
        const std::atomic<bool>* stop;
    };

    static void watch(j_common_ptr jpeg);
    std::size_t rowBytes() const {
        return static_cast<std::size_t>(mPhotograph.width * samplesPerPixel(mPhotograph.model));
    }
    // What follows runs inside an attempt.
    void configure();
    void setTables();
    void setScans();
    void writeRows();

    const Photograph& mPhotograph;
    const fs::path& mTarget;
    const JpegLayout mLayout;
    const int mQuality; ///< 0: the tables of the layout
    const bool mProgressive;
    Bytes mRow;
    JpegErrors mErrors;
    Output mOutput;
    Watch mWatch{};
    std::vector<jpeg_scan_info> mScans;
    jpeg_compress_struct mJpeg{};
};

// The library looks here after every few rows of every pass. Its own message about being stopped serves.
void Encoder::watch(j_common_ptr jpeg) {
    const std::atomic<bool>* stop = reinterpret_cast<const Watch*>(jpeg->progress)->stop;
    if (stop != nullptr && *stop)
        ERREXIT(jpeg, JERR_CANT_SUSPEND);
}

void Encoder::configure() {
    mJpeg.image_width = static_cast<JDIMENSION>(mPhotograph.width);
    mJpeg.image_height = static_cast<JDIMENSION>(mPhotograph.height);
    mJpeg.input_components = samplesPerPixel(mPhotograph.model);
    mJpeg.in_color_space = mPhotograph.model == ColorModel::Grey   ? JCS_GRAYSCALE
                           : mPhotograph.model == ColorModel::Cmyk ? JCS_CMYK
                                                                   : JCS_RGB;
    jpeg_set_defaults(&mJpeg);
    jpeg_set_colorspace(&mJpeg, spaceOf(mLayout.color));
    if (mPhotograph.model == ColorModel::Cmyk)
        mJpeg.write_Adobe_marker =
            mLayout.adobeMarker || mLayout.color == JpegLayout::Color::Ycck ? TRUE : FALSE;
    mJpeg.arith_code = mLayout.arithmetic ? TRUE : FALSE;
    mJpeg.optimize_coding = mLayout.arithmetic ? FALSE : TRUE;
    for (int i = 0; i < mJpeg.num_components; ++i) {
        mJpeg.comp_info[i].h_samp_factor = mLayout.components[static_cast<std::size_t>(i)].horizontal;
        mJpeg.comp_info[i].v_samp_factor = mLayout.components[static_cast<std::size_t>(i)].vertical;
    }
    if (mQuality > 0)
        jpeg_set_quality(&mJpeg, mQuality, TRUE);
    else
        setTables();
    setScans();
}

// The library divides by the entries, after it has multiplied them by eight in sixteen bits. No picture has
// steps as large as the upper limit; entries of zero are damage that decoders live with.
void Encoder::setTables() {
    for (int i = 0; i < mJpeg.num_components; ++i) {
        const JpegLayout::Component& component = mLayout.components[static_cast<std::size_t>(i)];
        mJpeg.comp_info[i].quant_tbl_no = component.table;
        JQUANT_TBL*& table = mJpeg.quant_tbl_ptrs[component.table];
        if (table == nullptr)
            table = jpeg_alloc_quant_table(reinterpret_cast<j_common_ptr>(&mJpeg));
        for (std::size_t k = 0; k < component.quantizer.size(); ++k)
            table->quantval[k] = std::clamp<UINT16>(component.quantizer[k], 1, 8191);
        table->sent_table = FALSE;
    }
}

// Components that do not fit into one scan get one each.
void Encoder::setScans() {
    int blocks = 0;
    for (const JpegLayout::Component& component : mLayout.components)
        blocks += component.horizontal * component.vertical;
    if (mProgressive)
        jpeg_simple_progression(&mJpeg);
    if (blocks <= kMostBlocks || mLayout.components.size() == 1)
        return;
    const jpeg_scan_info whole = {mJpeg.num_components, {0, 1, 2, 3}, 0, 63, 0, 0};
    const jpeg_scan_info* const scans = mProgressive ? mJpeg.scan_info : &whole;
    const int count = mProgressive ? mJpeg.num_scans : 1;
    for (const jpeg_scan_info* scan = scans; scan != scans + count; ++scan)
        for (int i = 0; i < scan->comps_in_scan; ++i) {
            mScans.push_back(*scan);
            mScans.back().comps_in_scan = 1;
            mScans.back().component_index[0] = scan->component_index[i];
        }
    mJpeg.scan_info = mScans.data();
    mJpeg.num_scans = static_cast<int>(mScans.size());
}

void Encoder::writeRows() {
    const bool inks = mPhotograph.model == ColorModel::Cmyk;
    while (mJpeg.next_scanline < mJpeg.image_height) {
        const std::uint8_t* samples = mPhotograph.samples.data() + mJpeg.next_scanline * mRow.size();
        if (inks)
            std::transform(samples, samples + mRow.size(), mRow.begin(),
                           [](std::uint8_t ink) { return static_cast<std::uint8_t>(255 - ink); });
        JSAMPROW line = inks ? mRow.data() : const_cast<JSAMPROW>(samples);
        jpeg_write_scanlines(&mJpeg, &line, 1);
    }
}

Bytes Encoder::encode() {
    const Bytes& profile = mPhotograph.iccProfile;
    if (profile.size() > kLongestProfile)
        throw PhotographError(mTarget.string() +
                              ": JPEG cannot hold so large an ICC profile; choose a PNG or TIFF target");
    const bool done = mErrors.attempt([&] {
        jpeg_create_compress(&mJpeg);
        mJpeg.dest = mOutput.manager();
        mJpeg.progress = &mWatch.base;
        configure();
        jpeg_start_compress(&mJpeg, TRUE);
        if (!profile.empty())
            jpeg_write_icc_profile(&mJpeg, profile.data(), static_cast<unsigned>(profile.size()));
        writeRows();
        jpeg_finish_compress(&mJpeg);
    });
    if (done)
        return std::move(mOutput.bytes());
    if (mWatch.stop != nullptr && *mWatch.stop)
        throw StoppedError(mTarget.string() + ": stopped; nothing was written");
    mErrors.throwIfOutOfMemory();
    throw PhotographError(mTarget.string() + ": JPEG encoding failed (" + mErrors.text() +
                          "); choose other settings or another format");
}

} // namespace

Bytes encodeJpeg(const Photograph& photograph, const fs::path& target, const WriteOptions& options) {
    return Encoder(photograph, target, options).encode();
}

} // namespace orvela
