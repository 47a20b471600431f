#include "files/JpegEncoder.h"
#include "files/JpegReader.h"
#include "files/PhotographReader.h"
#include "hosts/TestFiles.h"
#include "hosts/TestPhotograph.h"
#include "metadata/JpegSegments.h"

#include <gmock/gmock.h>

#include <cmath>
#include <map>

using namespace orvela;

namespace {

using testing::Contains;
using testing::Field;

Bytes bytesOf(const std::string& text) {
    return {text.begin(), text.end()};
}

// Calls visit(marker, content) for each segment up to the first scan, and for that scan's head.
template <typename Visit>
void walk(const Bytes& jpeg, Visit visit) {
    for (std::size_t at = 2; at + 4 < jpeg.size();) {
        const int marker = jpeg[at + 1];
        const std::size_t length = jpeg[at + 2] * 256U + jpeg[at + 3];
        visit(marker, ByteView(jpeg).subspan(at + 4, length - 2));
        if (marker == 0xDA)
            return;
        at += 2 + length;
    }
}

/// What the markers of a JPEG say about how its picture is stored.
struct Structure {
    int frame = 0; ///< kind of the frame, by its marker
    Bytes factors; ///< sampling factors and number of the table of each component
    std::map<int, Bytes> tables;
};

Structure structureOf(const Bytes& jpeg) {
    Structure structure;
    walk(jpeg, [&](int marker, ByteView content) {
        if (marker == 0xDB)
            for (auto at = content.begin(); at != content.end(); at += *at >> 4 ? 129 : 65)
                structure.tables[*at & 15] = Bytes(at, at + (*at >> 4 ? 129 : 65));
        if (marker >= 0xC0 && marker <= 0xC2) {
            structure.frame = marker;
            for (std::size_t at = 6; at + 2 < content.size(); at += 3)
                structure.factors.insert(structure.factors.end(), {content[at + 1], content[at + 2]});
        }
    });
    return structure;
}

double meanError(const Photograph& a, const Photograph& b) {
    double sum = 0;
    for (std::size_t i = 0; i < a.samples.size(); ++i)
        sum += std::abs(a.samples[i] - b.samples[i]);
    return sum / static_cast<double>(a.samples.size());
}

// Two files that a command makes of a.jpg, which is baseline and not subsampled: the components named R, G
// and B without a JFIF segment, and without names but with Adobe's mark of no colour transform.
constexpr char kNamed[] =
    "python3 -c \"b=bytearray(open('a.jpg','rb').read()); del b[2:20]; f=b.find(b'\\xff\\xc0'); "
    "s=b.find(b'\\xff\\xda'); b[f+10:f+19:3]=b'RGB'; b[s+5:s+11:2]=b'RGB'; open('s.jpg','wb').write(b)\"";
constexpr char kMarked[] =
    "python3 -c \"b=bytearray(open('a.jpg','rb').read()); "
    "b[2:20]=b'\\xff\\xee\\0\\x0eAdobe\\0\\x64\\0\\0\\0\\0\\0'; open('s.jpg','wb').write(b)\"";

struct Source {
    std::string make; ///< command that makes s.jpg of p.png
    double meanError; ///< that a second encoding may add, in levels
};

void PrintTo(const Source& source, std::ostream* out) {
    *out << source.make;
}

class JpegStructure : public testing::TestWithParam<Source> {};

TEST_P(JpegStructure, StaysThatOfTheSource) {
    const TestFolder folder;
    folder.run("convert $S/rocket.jpg -resize 203x149! p.png && " + GetParam().make);
    const Bytes source = bytesOf(folder.text("s.jpg"));
    const Photograph photograph = readJpeg(source, "s.jpg");
    const Bytes result = encodeJpeg(photograph, "t.jpg", {});
    const Structure before = structureOf(source);
    const Structure after = structureOf(result);
    EXPECT_EQ(after.frame, before.frame);
    EXPECT_EQ(after.factors, before.factors);
    EXPECT_EQ(after.tables, before.tables);
    EXPECT_EQ(photograph.encoding.jpeg, readJpeg(result, "t.jpg").encoding.jpeg);
    EXPECT_LT(meanError(photograph, readJpeg(result, "t.jpg")), GetParam().meanError);
    // As another decoder sees it.
    folder.put("t.jpg", {result.begin(), result.end()});
    const std::string error =
        folder.output("compare -metric MAE s.jpg t.jpg null: 2>&1 | sed 's/.*(\\(.*\\))/\\1/'");
    EXPECT_LT(std::stod(error) * 255, GetParam().meanError);
}

INSTANTIATE_TEST_SUITE_P(
    Sources, JpegStructure,
    testing::Values(
        Source{"convert p.png -sampling-factor 1x1 -quality 97 s.jpg", 0.6},
        Source{"convert p.png -sampling-factor 2x1 -quality 75 s.jpg", 0.9},
        Source{"convert p.png -sampling-factor 1x2 -quality 75 s.jpg", 0.9},
        Source{"convert p.png -sampling-factor 2x2 -quality 83 s.jpg", 0.9},
        Source{"convert p.png -sampling-factor 4x1 -quality 90 s.jpg", 1.2},
        Source{"convert p.png -sampling-factor 4x2 -quality 90 s.jpg", 1.2},
        Source{"convert p.png -sampling-factor 2x2 -interlace JPEG -quality 60 s.jpg", 0.9},
        Source{"convert p.png -colorspace Gray -quality 40 s.jpg", 0.5},
        Source{"convert p.png -colorspace CMYK -quality 91 s.jpg", 0.9},
        Source{std::string("convert p.png -sampling-factor 1x1 -quality 88 a.jpg && ") + kNamed, 0.9},
        Source{std::string("convert p.png -sampling-factor 1x1 -quality 88 a.jpg && ") + kMarked, 0.9}));

Photograph plain(ColorModel model, int width = 61, int height = 47) {
    return testPhotograph(model, 8, width, height, [](std::size_t i) { return i * i % 251; });
}

// Inks with and without a colour transform, factors that no scan of all components can hold, tables that
// differ under one number, entries of zero, which would be divided by.
TEST(JpegFile, WritesEveryLayoutThatCanBeRead) {
    using enum JpegLayout::Color;
    Photograph inks = plain(ColorModel::Cmyk);
    for (const bool marked : {false, true}) {
        const JpegLayout::Color color = marked ? Ycck : Cmyk;
        JpegLayout::Component component;
        component.quantizer.fill(3);
        inks.encoding.jpeg = {color, marked, {4, component}};
        inks.encoding.jpeg->components[0].horizontal = inks.encoding.jpeg->components[3].horizontal = 2;
        const Photograph read = readJpeg(encodeJpeg(inks, "t.jpg", {}), "t.jpg");
        EXPECT_EQ(read.encoding.jpeg, inks.encoding.jpeg);
        EXPECT_LT(meanError(read, inks), marked ? 40 : 25);
    }
    Photograph arithmetic = plain(ColorModel::Grey);
    JpegLayout::Component component;
    component.quantizer.fill(3);
    arithmetic.encoding.format = FileFormat::Jpeg;
    arithmetic.encoding.jpeg = {Grey, false, {component}, true};
    for (const bool progressive : {false, true}) {
        arithmetic.encoding.progressive = progressive;
        const Bytes coded = encodeJpeg(arithmetic, "t.jpg", {});
        EXPECT_EQ(jpegSize(coded), (JpegSize{61, 47}));
        EXPECT_EQ(readJpeg(coded, "t.jpg").encoding.jpeg, arithmetic.encoding.jpeg);
        EXPECT_LT(meanError(readJpeg(coded, "t.jpg"), arithmetic), 3);
        EXPECT_THAT(jpegSegments(coded), Contains(Field(&JpegSegment::marker, progressive ? 0xCA : 0xC9)));
    }
    Photograph wide = plain(ColorModel::Rgb);
    JpegLayout& layout = wide.encoding.jpeg.emplace();
    layout.components.resize(3);
    for (JpegLayout::Component& component : layout.components)
        component.quantizer.fill(2);
    layout.components[0].horizontal = layout.components[0].vertical = 4;
    layout.components[2].quantizer.fill(0);
    JpegLayout expected = layout;
    expected.components[1].table = 1;
    expected.components[2].table = 2;
    expected.components[2].quantizer.fill(1);
    wide.encoding.format = FileFormat::Jpeg;
    for (const bool progressive : {false, true}) {
        wide.encoding.progressive = progressive;
        const Photograph read = readJpeg(encodeJpeg(wide, "t.jpg", {}), "t.jpg");
        EXPECT_EQ(read.encoding.jpeg, expected);
        EXPECT_EQ(read.encoding.progressive, progressive);
    }
}

TEST(JpegFile, TakesGivenQualityAndChroma) {
    const TestFolder folder;
    folder.run("convert $S/rocket.jpg -resize 90x60! p.png && convert p.png -sampling-factor 2x1 -quality 75 "
               "s.jpg && "
               "convert p.png -sampling-factor 2x2 -quality 31 half.jpg && "
               "convert p.png -sampling-factor 1x1 -quality 31 full.jpg");
    const Photograph photograph = readJpeg(bytesOf(folder.text("s.jpg")), "s.jpg");
    WriteOptions options;
    options.quality = 31;
    for (const char* name : {"half.jpg", "full.jpg"}) {
        options.chromaSubsampled = std::string(name) == "half.jpg";
        const Photograph wanted = readJpeg(bytesOf(folder.text(name)), name);
        EXPECT_EQ(readJpeg(encodeJpeg(photograph, name, options), name).encoding.jpeg, wanted.encoding.jpeg)
            << name;
    }
    options.progressive = true;
    EXPECT_TRUE(readJpeg(encodeJpeg(photograph, "t.jpg", options), "t.jpg").encoding.progressive);
    // Red, green and blue have no brightness of their own: half resolution of colour parts it from them.
    Photograph rgb = photograph;
    rgb.encoding.jpeg->color = JpegLayout::Color::Rgb;
    WriteOptions half;
    half.chromaSubsampled = true;
    const Photograph parted = readJpeg(encodeJpeg(rgb, "t.jpg", half), "t.jpg");
    EXPECT_EQ(parted.encoding.jpeg->color, JpegLayout::Color::YCbCr);
    EXPECT_EQ(parted.encoding.jpeg->components[0].vertical, 2);
}

TEST(JpegFile, KeepsLargeProfiles) {
    const TestFolder folder;
    Photograph photograph = plain(ColorModel::Rgb);
    for (std::size_t i = 0; i < 200'000; ++i)
        photograph.iccProfile.push_back(static_cast<std::uint8_t>(i * i >> 5));
    const Bytes jpeg = encodeJpeg(photograph, "t.jpg", {});
    const Photograph read = readJpeg(jpeg, "t.jpg");
    EXPECT_EQ(read.iccProfile, photograph.iccProfile);
    // One of which a part is missing is none.
    Bytes parted = jpeg;
    const std::string_view head("ICC_PROFILE\0\2", 13);
    const auto second = std::search(parted.begin(), parted.end(), head.begin(), head.end());
    ASSERT_NE(second, parted.end());
    second[12] = 9;
    const Photograph without = readJpeg(parted, "t.jpg");
    EXPECT_TRUE(without.iccProfile.empty());
    EXPECT_THAT(without.unheld, testing::ElementsAre("the ICC profile, which is damaged"));
    photograph.iccProfile.resize(17'000'000);
    EXPECT_THROW(encodeJpeg(photograph, "t.jpg", {}), PhotographError);
}

// Bytes that are damaged in the picture itself are not taken for one.
TEST(JpegFile, RefusesDamage) {
    const TestFolder folder;
    folder.run("convert $S/rocket.jpg -resize 300x200! -quality 90 s.jpg");
    Bytes jpeg = bytesOf(folder.text("s.jpg"));
    for (std::size_t at = jpeg.size() / 2; at < jpeg.size() / 2 + 2000; ++at)
        jpeg[at] = static_cast<std::uint8_t>(at % 7 == 0 ? 0xFF : at);
    try {
        readJpeg(jpeg, "s.jpg");
        ADD_FAILURE() << "read";
    } catch (const PhotographError& error) {
        EXPECT_THAT(error.what(), testing::StartsWith("s.jpg: is damaged or cut short ("));
    }
}

// Each scan takes the time of a whole picture, and few bytes.
TEST(JpegFile, RefusesToReadForHours) {
    WriteOptions options;
    options.progressive = true;
    const Bytes jpeg = encodeJpeg(plain(ColorModel::Grey), "s.jpg", options);
    const std::string_view start("\xFF\xDA");
    const auto last = std::find_end(jpeg.begin(), jpeg.end(), start.begin(), start.end(),
                                    [](std::uint8_t a, char b) { return a == static_cast<std::uint8_t>(b); });
    Bytes many(jpeg.begin(), last);
    for (int i = 0; i < 1100; ++i)
        many.insert(many.end(), last, jpeg.end() - 2);
    append(many, "\xFF\xD9");
    try {
        readJpeg(many, "s.jpg");
        ADD_FAILURE() << "read";
    } catch (const PhotographError& error) {
        EXPECT_THAT(error.what(), testing::StartsWith("s.jpg: is damaged: it has over 1000 scans; "));
    }
}

TEST(JpegFile, StopsBetweenRows) {
    const std::atomic<bool> stop{true};
    WriteOptions options;
    options.stop = &stop;
    EXPECT_THROW(encodeJpeg(plain(ColorModel::Grey), "t.jpg", options), StoppedError);
}

} // namespace
