#include "files/JpegReader.h"

#include "files/JpegErrors.h"
#include "files/Refusal.h"

#include <jerror.h>

#include <algorithm>
#include <cstdlib>
#include <memory>

namespace orvela {

namespace {

namespace fs = std::filesystem;

constexpr int kProfileMarker = JPEG_APP0 + 2;
constexpr int kMostScans = 1000; // programs write some ten; a short file may hold so many that it takes hours

class Decoder {
public:
    Decoder(ByteView file, const fs::path& path) : mFile(file), mPath(path) {
        mJpeg.err = mErrors.manager();
        attempt([&] {
            jpeg_create_decompress(&mJpeg);
            mProgress.progress_monitor = watch;
            mJpeg.progress = &mProgress;
            jpeg_mem_src(&mJpeg, file.data(), file.size());
            jpeg_save_markers(&mJpeg, kProfileMarker, 0xFFFF);
            jpeg_read_header(&mJpeg, TRUE);
        });
    }
    ~Decoder() { jpeg_destroy_decompress(&mJpeg); }
    Decoder(const Decoder&) = delete;
    Decoder& operator=(const Decoder&) = delete;

    void readPicture(Photograph& photograph, const ReadLimits& limits);
    void readProfile(Photograph& photograph);
    Encoding encoding();

private:
    static void watch(j_common_ptr jpeg);
    template <typename Work>
    void attempt(const Work& work);
    ColorModel model() const;
    DeclaredPicture declared() const;
    JpegLayout::Color color() const;

    const ByteView mFile;
    const fs::path& mPath;
    JpegErrors mErrors;
    jpeg_progress_mgr mProgress{};
    jpeg_decompress_struct mJpeg{};
};

// The library looks here after every row of blocks of every scan.
void Decoder::watch(j_common_ptr jpeg) {
    if (reinterpret_cast<j_decompress_ptr>(jpeg)->input_scan_number > kMostScans)
        ERREXIT(jpeg, JERR_CANT_SUSPEND);
}

template <typename Work>
void Decoder::attempt(const Work& work) {
    if (mErrors.attempt(work))
        return;
    // The object dies unborn when this is the constructor's; what it holds is released twice at most.
    jpeg_destroy_decompress(&mJpeg);
    mErrors.throwIfOutOfMemory();
    if (mErrors.code() == JWRN_JPEG_EOF)
        refuse(mPath, "the file is cut short", kCopyAgain);
    if (mErrors.code() == JERR_CANT_SUSPEND) // see watch()
        refuse(mPath, "is damaged: it has over " + std::to_string(kMostScans) + " scans", kCopyAgain);
    if (mErrors.code() == JERR_BAD_PRECISION || mErrors.code() == JERR_SOF_UNSUPPORTED)
        refuse(mPath, "is a kind of JPEG that cannot be read (" + mErrors.text() + ")",
               "save it as a JPEG of 8 bits or as a TIFF");
    refuseUnread(mPath, mErrors.text());
}

ColorModel Decoder::model() const {
    switch (mJpeg.out_color_space) {
    case JCS_GRAYSCALE:
        return ColorModel::Grey;
    case JCS_RGB:
        return ColorModel::Rgb;
    case JCS_CMYK:
        return ColorModel::Cmyk;
    default:
        refuse(mPath, "has " + std::to_string(mJpeg.num_components) + " colour components of an unknown kind",
               "convert it to RGB, grey or CMYK");
    }
}

JpegLayout::Color Decoder::color() const {
    switch (mJpeg.jpeg_color_space) {
    case JCS_GRAYSCALE:
        return JpegLayout::Color::Grey;
    case JCS_RGB:
        return JpegLayout::Color::Rgb;
    case JCS_CMYK:
        return JpegLayout::Color::Cmyk;
    case JCS_YCCK:
        return JpegLayout::Color::Ycck;
    default:
        return JpegLayout::Color::YCbCr;
    }
}

DeclaredPicture Decoder::declared() const {
    DeclaredPicture picture;
    picture.width = mJpeg.image_width;
    picture.height = mJpeg.image_height;
    picture.sampleBytes = static_cast<std::uint64_t>(samplesPerPixel(model()));
    picture.fileBytes = mFile.size();
    if (mJpeg.arith_code == 0)
        picture.mostPixelsPerByte = bounds::kJpeg;
    return picture;
}

void Decoder::readPicture(Photograph& photograph, const ReadLimits& limits) {
    checkPicture(declared(), mPath, limits);
    photograph.model = model();
    photograph.width = static_cast<int>(mJpeg.image_width);
    photograph.height = static_cast<int>(mJpeg.image_height);
    const std::size_t row = mJpeg.image_width * static_cast<std::size_t>(samplesPerPixel(photograph.model));
    photograph.samples.resize(row * mJpeg.image_height);
    attempt([&] {
        jpeg_start_decompress(&mJpeg);
        while (mJpeg.output_scanline < mJpeg.output_height) {
            JSAMPROW line = photograph.samples.data() + row * mJpeg.output_scanline;
            jpeg_read_scanlines(&mJpeg, &line, 1);
        }
    });
    if (photograph.model == ColorModel::Cmyk)
        for (std::uint8_t& ink : photograph.samples)
            ink = static_cast<std::uint8_t>(255 - ink);
    photograph.encoding = encoding();
    // Reads on to the end marker, and forgets the tables.
    attempt([&] { jpeg_finish_decompress(&mJpeg); });
}

Encoding Decoder::encoding() {
    Encoding encoding;
    encoding.format = FileFormat::Jpeg;
    encoding.progressive = mJpeg.progressive_mode != 0;
    JpegLayout& layout = encoding.jpeg.emplace();
    layout.color = color();
    layout.arithmetic = mJpeg.arith_code != 0;
    layout.adobeMarker = mJpeg.num_components == 4 && mJpeg.saw_Adobe_marker != 0;
    for (int i = 0; i < mJpeg.num_components; ++i) {
        const jpeg_component_info& info = mJpeg.comp_info[i];
        if (info.quant_table == nullptr)
            refuse(mPath, "is damaged or cut short (a colour component is missing)", kCopyAgain);
        JpegLayout::Component& component = layout.components.emplace_back();
        component.horizontal = info.h_samp_factor;
        component.vertical = info.v_samp_factor;
        component.table = info.quant_tbl_no;
        std::copy_n(info.quant_table->quantval, component.quantizer.size(), component.quantizer.begin());
    }
    return encoding;
}

void Decoder::readProfile(Photograph& photograph) {
    JOCTET* data = nullptr;
    unsigned size = 0;
    attempt([&] { jpeg_read_icc_profile(&mJpeg, &data, &size); });
    const std::unique_ptr<JOCTET, decltype(&std::free)> owner(data, std::free);
    photograph.iccProfile.assign(data, data + size);
    if (data == nullptr && mErrors.code() == JWRN_BOGUS_ICC)
        photograph.unheld.emplace_back("the ICC profile, which is damaged");
}

} // namespace

Photograph readJpeg(ByteView file, const fs::path& path, const ReadLimits& limits) {
    Photograph photograph;
    photograph.source = path;
    Decoder decoder(file, path);
    decoder.readProfile(photograph);
    decoder.readPicture(photograph, limits);
    return photograph;
}

} // namespace orvela
