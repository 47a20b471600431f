#include "PluginEntry/Exchange/CARGBPlanePhotoshop.h"
#include "files/PhotographReader.h"
#include "files/PhotographWriter.h"
#include "hosts/TestFiles.h"
#include "support/HostedPicture.h"

#include <gmock/gmock.h>

#include <cmath>
#include <map>
#include <memory>
#include <ostream>

using namespace orvela;

namespace {

// What the filter does when no task changes anything.
Photograph identityRun(const Photograph& photograph) {
    HostedPicture host(photograph);
    CARGBPlanePhotoshop plane(0, 0, QStringLiteral("identity"));
    std::int16_t result = 0;
    plane.FillFrom_Photoshop_Data(&host.record(), &result);
    plane.copyPlaneToPS(&host.record(), &result);
    return std::move(host.result);
}

struct Case {
    std::string make; ///< shell command that makes the source from p8.png or p16.png
    std::string source;
    std::string target;
    ColorModel model;
    int depth;
    double meanError; ///< of the encoding, on average, in levels of 255; 0 for one without loss

    /// The channels as the independent decoder names them.
    std::string raw() const {
        using enum ColorModel;
        return model == Rgb ? "rgb" : model == Grey ? "gray" : model == Cmyk ? "cmyk" : "rgba";
    }
};

void PrintTo(const Case& c, std::ostream* out) {
    *out << c.make << " -> " << c.target;
}

class RoundTrip : public testing::TestWithParam<Case> {
protected:
    static void SetUpTestSuite() {
        pictures = std::make_unique<TestFolder>();
        pictures->run("convert $S/coffee.png -resize 61x47! -depth 8 -define png:color-type=2 p8.png");
        pictures->run(
            "convert $S/coffee.png -depth 16 -resize 61x47! -level 1%,97% -define png:bit-depth=16 p16.png");
    }
    static void TearDownTestSuite() { pictures.reset(); }

    static inline std::unique_ptr<TestFolder> pictures; ///< what every case's source is made from
};

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
    const TestFolder folder;
    std::filesystem::copy(*pictures / "p8.png", folder / "p8.png");
    std::filesystem::copy(*pictures / "p16.png", folder / "p16.png");
    folder.run(c.make);
    const std::string& source = c.source;
    const std::string& target = c.target;
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
    EXPECT_THAT(writePhotograph(result, folder / target), testing::SizeIs(read.notes.size()));

    expectSamePixels(decoded(folder, source, c), decoded(folder, target, c), c);
    const Photograph again = readPhotograph(folder / target);
    EXPECT_EQ(again.model, c.model);
    EXPECT_EQ(again.depth, c.depth);
    if (read.encoding.format == again.encoding.format) {
        EXPECT_EQ(again.encoding.jpeg, read.encoding.jpeg);
        EXPECT_EQ(again.encoding.chroma, read.encoding.chroma);
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

std::vector<Case> cases() {
    using enum ColorModel;
    static const std::map<std::string, ColorModel> models = {
        {"Grey", Grey}, {"GreyAlpha", GreyAlpha}, {"Rgb", Rgb}, {"RgbAlpha", RgbAlpha}, {"Cmyk", Cmyk}};
    std::vector<Case> all;
    for (const std::vector<std::string>& row : tableRows("round_trips.txt"))
        all.push_back({row.at(5), row[0], row[1], models.at(row[2]), std::stoi(row[3]), std::stod(row[4])});
    return all;
}
INSTANTIATE_TEST_SUITE_P(Files, RoundTrip, testing::ValuesIn(cases()));

} // namespace
