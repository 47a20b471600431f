#include "PluginEntry/CARGBPlanePhotoshop.h"
#include "common/ImageHost.h"
#include "common/PhotographReader.h"
#include "common/PhotographWriter.h"
#include "hosts/TestFiles.h"

#include <cmath>
#include <ostream>

using namespace orvela;

namespace {

// What the filter does when no task changes anything.
Photograph identityRun(Photograph photograph) {
    ImageHost host(std::move(photograph));
    CARGBPlanePhotoshop plane(0, 0, QStringLiteral("identity"));
    std::int16_t result = 0;
    plane.FillFrom_Photoshop_Data(&host.record(), &result);
    plane.copyPlaneToPS(&host.record(), &result);
    return std::move(host.photograph());
}

struct Case {
    const char* make; ///< shell command that makes the file from p8.png or p16.png
    const char* source;
    const char* target;
    ColorModel model;
    int depth;
    double meanError = 0; ///< of the encoding, on average, in levels of 255

    /// The channels as the independent decoder names them.
    std::string raw() const {
        using enum ColorModel;
        return model == Rgb ? "rgb" : model == Grey ? "gray" : model == Cmyk ? "cmyk" : "rgba";
    }
};

void PrintTo(const Case& c, std::ostream* out) {
    *out << c.make << " -> " << c.target;
}

class RoundTrip : public testing::TestWithParam<Case> {};

std::vector<int> decoded(const TestFolder& folder, const std::string& file, const Case& c) {
    const std::string depth = std::to_string(c.depth);
    const std::string bytes =
        folder.output("convert '" + file + "[0]' -depth " + depth + " -endian LSB " + c.raw() + ":-");
    std::vector<int> samples;
    for (std::size_t i = 0; i < bytes.size(); i += static_cast<std::size_t>(c.depth) / 8) {
        const auto byte = [&](std::size_t at) {
            return static_cast<int>(static_cast<unsigned char>(bytes[at]));
        };
        samples.push_back(c.depth == 8 ? byte(i) : byte(i) + 256 * byte(i + 1));
    }
    return samples;
}

// 8 bits come back as they were; of 16 bits the mapping to 8 keeps the floor, so that a sample may lose up to
// one level of 257 and the roundings; the fourth channel and transparency lose nothing.
void expectSamePixels(const std::vector<int>& before, const std::vector<int>& after, const Case& c) {
    ASSERT_EQ(before.size(), after.size());
    ASSERT_FALSE(before.empty());
    const bool four = samplesPerPixel(c.model) % 2 == 0;
    double sum = 0;
    for (std::size_t i = 0; i < before.size(); ++i) {
        const int lost = before[i] - after[i];
        sum += std::abs(lost);
        if (c.meanError > 0)
            continue;
        const bool kept = c.depth == 8 || (four && i % 4 == 3);
        ASSERT_GE(lost, kept ? 0 : -2) << "sample " << i;
        ASSERT_LE(lost, kept ? 0 : 260) << "sample " << i;
    }
    if (c.meanError > 0) {
        EXPECT_LT(sum / static_cast<double>(before.size()), c.meanError);
    }
}

constexpr char kTag[] =
    "exiftool -q -overwrite_original -Make=Canon -Model='Canon EOS 5D' -ISO=200 -Orientation#=6 "
    "-GPSLatitude=48.5 -GPSLatitudeRef=N -XMP-dc:Title='A title' -IPTC:Keywords=cup -IPTC:Keywords=wood ";
constexpr char kList[] =
    "exiftool -a -G1 -s -EXIF:all -XMP:all -IPTC:all -GPS:all "
    "-x ImageWidth -x ImageHeight -x StripOffsets -x StripByteCounts -x RowsPerStrip -x BitsPerSample "
    "-x Compression -x PhotometricInterpretation -x SamplesPerPixel -x PlanarConfiguration -x Predictor "
    "-x SampleFormat -x ExtraSamples -x FillOrder -x PageNumber -x InkSet -x ColorMap -x XMPToolkit -x "
    "YCbCrPositioning ";

TEST_P(RoundTrip, KeepsPixelsAndMetadata) {
    const Case& c = GetParam();
    static const TestFolder pictures;
    static const bool made = [] {
        pictures.run("convert $S/coffee.png -resize 61x47! -depth 8 -define png:color-type=2 p8.png");
        pictures.run(
            "convert $S/coffee.png -depth 16 -resize 61x47! -level 1%,97% -define png:bit-depth=16 p16.png");
        return true;
    }();
    ASSERT_TRUE(made);
    const TestFolder folder;
    std::filesystem::copy(pictures / "p8.png", folder / "p8.png");
    std::filesystem::copy(pictures / "p16.png", folder / "p16.png");
    folder.run(c.make);
    const std::string source(c.source);
    const std::string target(c.target);
    const bool heif = source.ends_with(".heic") || source.ends_with(".avif");
    const char* profile = c.model == ColorModel::Cmyk    ? "ghostscript/default_cmyk.icc"
                          : samplesPerPixel(c.model) < 3 ? "Gray.icc"
                                                         : "sRGB.icc";
    if (!heif)
        folder.run(kTag + std::string("'-ICC_Profile<=/usr/share/color/icc/") + profile + "' " + source);

    const Photograph read = readPhotograph(folder / source);
    EXPECT_EQ(read.model, c.model);
    EXPECT_EQ(read.depth, c.depth);
    const Photograph result = identityRun(read);
    EXPECT_EQ(writePhotograph(result, folder / target), std::vector<std::string>{});

    expectSamePixels(decoded(folder, source, c), decoded(folder, target, c), c);
    const Photograph again = readPhotograph(folder / target);
    EXPECT_EQ(again.model, c.model);
    EXPECT_EQ(again.depth, c.depth);
    if (read.encoding.format == again.encoding.format) {
        EXPECT_EQ(again.encoding.quality, read.encoding.quality);
        EXPECT_EQ(again.encoding.chromaSubsampled, read.encoding.chromaSubsampled);
        EXPECT_EQ(again.encoding.compression, read.encoding.compression);
        EXPECT_EQ(again.encoding.lossless, read.encoding.lossless);
        EXPECT_EQ(again.encoding.progressive, read.encoding.progressive);
        EXPECT_EQ(again.encoding.bitDepth, read.encoding.bitDepth);
    }
    if (heif)
        return;
    // A PSD has its resolution outside the Exif, whose own, if any, is ignored.
    const std::string ignored = source.ends_with(".psd") ? "-x XResolution -x YResolution " : "";
    folder.run(kList + ignored + "-w! %f.txt " + source + " " + target);
    EXPECT_EQ(folder.text("s.txt"), folder.text("t.txt"));
    EXPECT_NE(folder.text("t.txt").find("Orientation"), std::string::npos);
    folder.run("exiftool -q -q -b -icc_profile -w! %f.icc " + source + " " + target + " && cmp s.icc t.icc");
}

using enum ColorModel;
constexpr Case kCases[] = {
    {"convert p8.png -sampling-factor 2x2 -quality 83 s.jpg", "s.jpg", "t.jpg", Rgb, 8, 2.5},
    {"convert p8.png -sampling-factor 1x1 -interlace JPEG -quality 97 s.jpg", "s.jpg", "t.jpg", Rgb, 8, 1.5},
    {"convert p8.png -colorspace Gray -quality 90 s.jpg", "s.jpg", "t.jpg", Grey, 8, 1.5},
    {"convert p8.png -colorspace CMYK -quality 95 s.jpg", "s.jpg", "t.jpg", Cmyk, 8, 1.5},
    {"convert p8.png -quality 92 s.jpg", "s.jpg", "t.png", Rgb, 8},
    {"cp p8.png s.png", "s.png", "t.png", Rgb, 8},
    {"convert p8.png -interlace PNG s.png", "s.png", "t.png", Rgb, 8},
    {"convert p8.png -colors 16 png8:s.png", "s.png", "t.png", Rgb, 8},
    {"cp p16.png s.png", "s.png", "t.png", Rgb, 16},
    {"convert p8.png -colorspace Gray s.png", "s.png", "t.png", Grey, 8},
    {"convert p16.png -colorspace Gray -depth 16 s.png", "s.png", "t.png", Grey, 16},
    {"convert p8.png '(' +clone -negate -colorspace Gray ')' -alpha off -compose CopyOpacity -composite "
     "s.png",
     "s.png", "t.png", RgbAlpha, 8},
    {"vips bandjoin 'p16.png p16.png[]' j.v && vips extract_band j.v s.png 0 --n 4", "s.png", "t.png",
     RgbAlpha, 16},
    {"vips extract_band p8.png a.v 0 --n 2 && vips copy a.v s.png --interpretation b-w", "s.png", "t.png",
     GreyAlpha, 8},
    {"vips extract_band p16.png a.v 0 --n 2 && vips copy a.v s.png --interpretation grey16", "s.png", "t.png",
     GreyAlpha, 16},
    {"vips extract_band p8.png a.v 0 --n 2 && vips copy a.v s.tif --interpretation b-w", "s.tif", "t.tif",
     GreyAlpha, 8},
    {"convert p8.png -compress LZW s.tif", "s.tif", "t.tif", Rgb, 8},
    {"convert p8.png -endian MSB -compress Zip s.tiff", "s.tiff", "t.tiff", Rgb, 8},
    {"convert p16.png -depth 16 -compress None s.tif", "s.tif", "t.tif", Rgb, 16},
    {"convert p8.png -colorspace Gray -compress RLE s.tif", "s.tif", "t.tif", Grey, 8},
    {"convert p16.png -colorspace Gray -depth 16 s.tif", "s.tif", "t.tif", Grey, 16},
    {"vips bandjoin 'p8.png p8.png[]' j.v && vips extract_band j.v s.tif[compression=lzw] 0 --n 4", "s.tif",
     "t.tif", RgbAlpha, 8},
    {"vips bandjoin 'p16.png p16.png[]' j.v && vips extract_band j.v s.tif 0 --n 4", "s.tif", "t.tif",
     RgbAlpha, 16},
    {"convert p8.png -colorspace CMYK -compress LZW s.tif", "s.tif", "t.tif", Cmyk, 8},
    {"convert p16.png -colorspace CMYK -depth 16 s.tif", "s.tif", "t.tif", Cmyk, 16},
    {"convert p8.png -compress RLE s.psd", "s.psd", "t.tif", Rgb, 8},
    {"convert p8.png -compress None -colorspace Gray s.psd", "s.psd", "t.tif", Grey, 8},
    {"convert p8.png -colorspace CMYK -compress RLE s.psd", "s.psd", "t.tif", Cmyk, 8},
    {"convert p16.png -depth 16 -compress RLE s.psd", "s.psd", "t.tif", Rgb, 16},
    {"convert p16.png -depth 16 -colorspace CMYK -compress None s.psd", "s.psd", "t.tif", Cmyk, 16},
    {"vips webpsave p8.png s.webp --lossless", "s.webp", "t.webp", Rgb, 8},
    {"vips bandjoin 'p8.png p8.png[]' j.v && vips extract_band j.v j.png 0 --n 4 && vips webpsave j.png "
     "s.webp --lossless",
     "s.webp", "t.webp", RgbAlpha, 8},
    {"vips webpsave p8.png s.webp --Q 90", "s.webp", "t.webp", Rgb, 8, 3},
    {"vips heifsave p8.png s.heic --Q 95", "s.heic", "t.heic", Rgb, 8, 3},
    {"vips heifsave p16.png s.heic --Q 95 --bitdepth 10", "s.heic", "t.heic", Rgb, 16, 500},
    {"vips heifsave p8.png s.avif --Q 95 --compression av1", "s.avif", "t.avif", Rgb, 8, 3},
};
INSTANTIATE_TEST_SUITE_P(Files, RoundTrip, testing::ValuesIn(kCases));

} // namespace
