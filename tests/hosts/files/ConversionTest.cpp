#include "files/Conversion.h"

#include "files/PhotographReader.h"
#include "files/PhotographWriter.h"
#include "hosts/TestFiles.h"
#include "hosts/TestPhotograph.h"

#include <gmock/gmock.h>

using namespace orvela;

namespace {

using testing::ElementsAre;

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
}

} // namespace
