#include "files/Conversion.h"

#include "files/PhotographReader.h"
#include "files/PhotographWriter.h"
#include "hosts/TestFiles.h"
#include "hosts/TestPhotograph.h"

#include <gmock/gmock.h>

using namespace orvela;

namespace {

using testing::ElementsAre;
using testing::EndsWith;
using testing::HasSubstr;

Photograph pixel(ColorModel model, int depth, const Bytes& samples) {
    return testPhotograph(model, depth, 1, 1, [&](std::size_t i) { return samples[i]; });
}

Bytes after(FileFormat format, const Photograph& photograph) {
    return converted(photograph, conversionFor(format, photograph)).samples;
}

// 16 bits are stored low byte first: 0x8080 is 128 * 257, 0x0081 rounds to 1, 0x0080 to 0.
TEST(Conversion, RoundsAndLaysOverWhite) {
    using enum ColorModel;
    using enum FileFormat;
    EXPECT_EQ(after(Jpeg, pixel(Rgb, 16, {0x80, 0x80, 0x81, 0, 0x80, 0})), Bytes({128, 1, 0}));
    EXPECT_EQ(after(Jpeg, pixel(Cmyk, 16, {0xFF, 0xFF, 0, 0, 0, 0, 0x80, 0x80})), Bytes({255, 0, 0, 128}));
    // (100 * 128 + 255 * 127) / 255 = 177.2; nothing of an invisible pixel shows, all of an opaque one.
    EXPECT_EQ(after(Jpeg, pixel(GreyAlpha, 8, {100, 128})), Bytes({177}));
    EXPECT_EQ(after(Jpeg, pixel(RgbAlpha, 8, {10, 20, 30, 0})), Bytes({255, 255, 255}));
    EXPECT_EQ(after(Jpeg, pixel(RgbAlpha, 16, {0x80, 0x80, 0, 0, 0xFF, 0xFF, 0xFF, 0xFF})),
              Bytes({128, 0, 255}));
    EXPECT_EQ(after(WebP, pixel(GreyAlpha, 8, {100, 128})), Bytes({100, 100, 100, 128}));
    EXPECT_EQ(after(Heif, pixel(Grey, 16, {1, 2})), Bytes({1, 2, 1, 2, 1, 2}));
}

// Flat files of 2 x 1 pixels, with a saved selection that shows neither; `layers` is the section of layers.
std::string psd(int depth, const std::string& layers) {
    return "python3 -c \"import struct\nlayers = " + layers + "\nopen('s.psd', 'wb').write(b'8BPS' + " +
           "struct.pack('>H6xHIIHH', 1, 4, 1, 2, " + std::to_string(depth) + ", 3) + bytes(8) + " +
           "struct.pack('>I', len(layers)) + layers + bytes(2) + bytes(range(8 * " +
           std::to_string(depth / 8) + ")))\"";
}

TEST(Conversion, TakesNoSelectionForTransparency) {
    const TestFolder folder;
    WriteOptions force;
    force.overwrite = true;
    folder.run("convert -size 8x8 xc:'rgb(200,100,50)' -alpha set -channel A -evaluate set 0 a.png && "
               "vips tiffsave a.png a.tif && LC_ALL=C sed "
               "'s/\\x52\\x01\\x03\\x00\\x01\\x00\\x00\\x00./\\x52\\x01\\x03\\x00\\x01\\x00\\x00\\x00\\x00/' "
               "a.tif >s.tif && " +
               psd(8, "b''"));
    for (const char* name : {"s.tif", "s.psd"}) {
        const Photograph photograph = readPhotograph(folder / name);
        EXPECT_EQ(photograph.model, ColorModel::RgbAlpha);
        EXPECT_THAT(writePhotograph(photograph, folder / "t.tif", force), testing::IsEmpty());
        EXPECT_EQ(folder.output("exiftool -s3 -ExtraSamples t.tif"), "Unspecified\n") << name;
        EXPECT_THAT(writePhotograph(photograph, folder / "t.png", force),
                    ElementsAre(EndsWith("cannot hold: the extra channel")));
        const Photograph result = readPhotograph(folder / "t.png");
        EXPECT_EQ(result.model, ColorModel::Rgb);
        const bool tiff = photograph.width == 8;
        EXPECT_THAT(Bytes(result.samples.begin(), result.samples.begin() + 3),
                    ElementsAre(tiff ? 200 : 0, tiff ? 100 : 2, tiff ? 50 : 4));
        EXPECT_TRUE(writePhotograph(photograph, folder / "t.jpg", force).size() == 1);
        EXPECT_NEAR(readPhotograph(folder / "t.jpg").samples[0], tiff ? 200 : 0, 6);
    }
    // Two layers, of which the first transparency is the picture's; those of 16 bits stand apart.
    folder.run(psd(8, "struct.pack('>IhI', 2, -2, 0)"));
    EXPECT_FALSE(readPhotograph(folder / "s.psd").extraChannel);
    folder.run(psd(16, "bytes(8) + b'8BIMPatt' + struct.pack('>I', 2) + bytes(4) + b'8BIMLr16' + "
                       "struct.pack('>Ih', 2, -3)"));
    folder.run("printf 'of another program' >>s.psd");
    const Photograph deep = readPhotograph(folder / "s.psd");
    EXPECT_FALSE(deep.extraChannel);
    EXPECT_THAT(writePhotograph(deep, folder / "deep.tif"),
                ElementsAre(EndsWith("hold: the layers; 18 bytes behind the picture")));
}

// The reds of four pixels in a PSD whose other colours are white.
std::vector<int> redsOfPsd(const TestFolder& folder, int depth, const std::string& reds,
                           const std::string& alphas) {
    folder.run(
        "python3 -c \"import struct\nplanes = [" + reds + "] + [255] * 8 + [" + alphas +
        "]\nlayers = struct.pack('>IhI', 2, -1, 0)\nopen('s.psd', 'wb').write(b'8BPS' + "
        "struct.pack('>H6xHIIHH', 1, 4, 1, 4, " +
        std::to_string(depth) +
        ", 3) + bytes(8) + struct.pack('>I', len(layers)) + layers + bytes(2) + bytes(x for p in planes "
        "for x in [p] * " +
        std::to_string(depth / 8) + "))\"");
    const Photograph photograph = readPhotograph(folder / "s.psd");
    std::vector<int> found; // both bytes of 16 bits are the same
    for (std::size_t at = 0; at < photograph.samples.size(); at += photograph.samples.size() / 4)
        found.push_back(photograph.samples[at]);
    return found;
}

// A fifth of the colour 50 over white is 50 / 5 + 255 * 4 / 5 = 214. Opaque colours are as they stand, and
// invisible ones stay, too. A colour of 100 over a fifth of transparency, with at least 204 of white, was not
// mixed.
TEST(Conversion, TakesWhiteOutOfTransparentColoursOfPsd) {
    const TestFolder folder;
    for (const int depth : {8, 16}) {
        EXPECT_THAT(redsOfPsd(folder, depth, "214, 204, 7, 255", "51, 51, 255, 0"),
                    ElementsAre(50, 0, 7, 255));
        EXPECT_THAT(redsOfPsd(folder, depth, "214, 100, 7, 255", "51, 51, 255, 0"),
                    ElementsAre(214, 100, 7, 255));
    }
}

TEST(Conversion, IsToldInOneLine) {
    const TestFolder folder;
    folder.run("vips bandjoin \"$S/coffee.png $S/coffee.png[]\" j.v && vips extract_band j.v k.v 0 --n 4 && "
               "vips cast k.v l.v ushort --shift && vips copy l.v s.png --interpretation rgb16 && "
               "convert $S/coffee.png -colorspace Gray -resize 64x -strip +set date:create +set date:modify "
               "g.png && exiftool -q -overwrite_original "
               "'-ICC_Profile<=/usr/share/color/icc/Gray.icc' g.png");
    const Photograph deep = readPhotograph(folder / "s.png");
    const std::string source = (folder / "s.png").string();
    EXPECT_THAT(writePhotograph(deep, folder / "t.jpg"),
                ElementsAre(source + ": the JPEG file cannot hold: 16 bits per sample (8 are kept); "
                                     "transparency (laid over white)"));
    EXPECT_THAT(writePhotograph(deep, folder / "t.webp"),
                ElementsAre(source + ": the WebP file cannot hold: 16 bits per sample (8 are kept)"));
    EXPECT_EQ(readPhotograph(folder / "t.jpg").model, ColorModel::Rgb);
    EXPECT_EQ(readPhotograph(folder / "t.webp").model, ColorModel::RgbAlpha);
    const Photograph grey = readPhotograph(folder / "g.png");
    EXPECT_THAT(writePhotograph(grey, folder / "g.heic"),
                ElementsAre((folder / "g.png").string() +
                            ": the HEIF file cannot hold: the ICC profile, which is one for grey"));
    EXPECT_EQ(readPhotograph(folder / "g.heic").model, ColorModel::Rgb);
    // A profile for RGB, which some programs give to grey pictures, stays.
    Photograph odd = grey;
    folder.run("cp /usr/share/color/icc/sRGB.icc p.icc");
    const std::string profile = folder.text("p.icc");
    odd.iccProfile.assign(profile.begin(), profile.end());
    EXPECT_THAT(writePhotograph(odd, folder / "o.webp"), testing::IsEmpty());
    EXPECT_EQ(readPhotograph(folder / "o.webp").iccProfile, odd.iccProfile);
    EXPECT_THAT(writePhotograph(odd, folder / "o.png"), ElementsAre(HasSubstr("the ICC profile")));
}

} // namespace
