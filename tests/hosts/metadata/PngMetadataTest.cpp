// What programs leave in PNG files beside the usual.

#include "hosts/ChangedFiles.h"
#include "metadata/ImageResources.h"
#include "metadata/MetadataReader.h"
#include "metadata/PngTexts.h"

#include <gmock/gmock.h>

using namespace orvela;

namespace {

using testing::ElementsAre;
using testing::EndsWith;
using testing::HasSubstr;
using testing::IsEmpty;

constexpr char kPlain[] = "convert $S/coffee.png -resize 64x48! -strip -define png:exclude-chunks=all s.png ";

// A text of digits as programs write it, in Python.
std::string digits(const std::string& kind, const std::string& bytes) {
    return "chunk(b'zTXt', b'Raw profile type " + kind + "\\0\\0' + zlib.compress(b'\\n" + kind +
           "\\n%8d\\n' % len(" + bytes + ") + (" + bytes + ").hex().encode()))";
}

std::string put(const std::string& piece) {
    return insert("s.png", kBehindPngHeader, piece);
}

TEST(PngMetadata, NamesWhatStandsBehindTheEnd) {
    const TestFolder folder;
    folder.run(std::string(kPlain) + "&& cp s.png f.png && cp s.png z.png && " +
               insert("s.png", 100000, "chunk(b'tEXt', b'Author\\0A')") + " && " +
               insert("f.png", 100000, "struct.pack('>I', 20) + b'ftypmp42' + bytes(12) + b'film'") +
               " && head -c 9 /dev/zero >>z.png");
    EXPECT_THAT(convert(folder, "s.png", "t.png"),
                ElementsAre(EndsWith("hold: 20 bytes behind the picture")));
    EXPECT_THAT(folder.output("exiftool -s3 -Author t.png"), IsEmpty());
    EXPECT_THAT(convert(folder, "f.png", "t.jpg"),
                ElementsAre(EndsWith("hold: the film behind the picture")));
    EXPECT_THAT(convert(folder, "z.png", "z.jpg"), IsEmpty());
}

TEST(PngMetadata, TakesAProfileThatStandsAsDigits) {
    const TestFolder folder;
    folder.run("cp /usr/share/color/icc/sRGB.icc icc && " + std::string(kPlain) +
               "&& cp s.png i.png && exiftool -q -overwrite_original '-ICC_Profile<=icc' i.png && "
               "cp i.png j.png && cp s.png w.png");
    const std::string icc = "open('icc', 'rb').read()";
    folder.run(put(digits("icc", icc)) + " && " + insert("i.png", kBehindPngHeader, digits("icm", icc)) +
               " && " + insert("j.png", kBehindPngHeader, digits("icm", icc + " + b'1'")) + " && " +
               insert("w.png", kBehindPngHeader, digits("icc", "b'damaged'")));
    for (const char* target : {"a.png", "a.jpg", "a.tif", "a.webp"}) {
        EXPECT_THAT(convert(folder, "s.png", target), IsEmpty()) << target;
        folder.run(std::string("exiftool -b -ICC_Profile ") + target + " | cmp - icc");
    }
    EXPECT_THAT(convert(folder, "i.png", "b.jpg"), IsEmpty());
    EXPECT_THAT(convert(folder, "j.png", "c.jpg"), ElementsAre(EndsWith("hold: a second ICC profile")));
    EXPECT_THAT(convert(folder, "w.png", "d.jpg"),
                ElementsAre(EndsWith("the ICC profile, which does not suit its colours or is damaged")));
}

// The same twice is no loss. What has a place of its own goes before digits.
TEST(PngMetadata, NamesASecondBlockOfAKind) {
    const TestFolder folder;
    const auto exif = [](const char* artist) {
        return "(b'II*\\0\\x08\\0\\0\\0\\1\\0\\x3B\\1\\2\\0\\4\\0\\0\\0" + std::string(artist) +
               "\\0\\0\\0\\0\\0')";
    };
    const auto xmp = [](const std::string& text) {
        return "b'<x:xmpmeta xmlns:x=\\'adobe:ns:meta/\\'>" + text + "</x:xmpmeta>'";
    };
    const auto xmpChunk = [&](const std::string& text) {
        return "chunk(b'iTXt', b'XML:com.adobe.xmp\\0\\0\\0\\0\\0' + " + xmp(text) + ")";
    };
    const auto notes = [&](const std::string& pieces) {
        folder.run(kPlain + ("&& " + put(pieces)));
        std::vector<std::string> told = convert(folder, "s.png", "t.png");
        for (std::string& note : told)
            note.erase(0, note.find("hold: ") + 6);
        return told;
    };
    EXPECT_THAT(notes(digits("exif", exif("two")) + " + chunk(b'eXIf', " + exif("one") + ")"),
                ElementsAre("a second Exif block"));
    EXPECT_EQ(folder.output("exiftool -s3 -Artist t.png && rm t.png"), "one\n");
    EXPECT_THAT(notes(digits("exif", exif("one")) + " + chunk(b'eXIf', " + exif("one") + ")"), IsEmpty());
    folder.run("rm t.png");
    EXPECT_THAT(notes(digits("xmp", xmp("2")) + " + " + xmpChunk("1") + " + " + xmpChunk("3")),
                ElementsAre("a second XMP packet"));
    EXPECT_THAT(folder.text("t.png"), HasSubstr(">1</x:xmpmeta>"));
    folder.run("rm t.png");
    // Both of a program that writes the same list under two names, and what only one of them has.
    const std::string iptc = "b'\\x1c\\2\\5\\0\\1T'";
    EXPECT_THAT(notes(digits("iptc", iptc) + " + " +
                      digits("8bim", "b'8BIM\\4\\4\\0\\0\\0\\0\\0\\6' + " + iptc +
                                         " + b'8BIM\\x0b\\xb7\\0\\0\\0\\0\\0\\4path'")),
                IsEmpty());
    const std::string text = folder.text("t.png");
    const Metadata metadata = readMetadata(asBytes(text), FileFormat::Png);
    const ImageResources resources = imageResources(metadata.resources);
    ASSERT_EQ(resources.list.size(), 2U);
    EXPECT_EQ(asText(resources.list[1].data), "path");
}

// Of packed texts only those are unpacked that mean anything, to so much in all.
TEST(PngMetadata, UnpacksLittle) {
    const TestFolder folder;
    folder.run(std::string(kPlain) + "&& " +
               put("b''.join(chunk(b'zTXt', k + b'\\0\\0' + zlib.compress(bytes(20 << 20))) for k in "
                   "[b'Title'] * 2 + [b'Comment'] * 2) + chunk(b'tEXt', b'Author\\0A')"));
    const std::string text = folder.text("s.png");
    const Metadata metadata = readMetadata(asBytes(text), FileFormat::Png);
    std::size_t held = 0;
    for (const Text& one : metadata.texts)
        held += one.text.size();
    EXPECT_LE(held, kMostText);
    EXPECT_THAT(metadata.damaged, ElementsAre("a PNG text"));
    EXPECT_THAT(convert(folder, "s.png", "t.jpg"),
                testing::Contains(HasSubstr("the JPEG file cannot hold: PNG texts Title")));
    EXPECT_EQ(folder.output("exiftool -s3 -Artist t.jpg"), "A\n");
    EXPECT_THAT(convert(folder, "s.png", "t.png"), ElementsAre(HasSubstr("damaged")));
    EXPECT_EQ(folder.output("grep -ao 'Title\\|Comment' t.png | wc -l"), "4\n"); // as they stand
}

TEST(PngMetadata, HoldsNoZeroOfAComment) {
    const TestFolder folder;
    folder.run("convert $S/coffee.png -resize 64x48! -strip s.jpg && cp s.jpg i.jpg && " +
               insert("s.jpg", kBehindJpegStart, "segment(0xFE, b'A comment\\0\\0')") + " && " +
               insert("i.jpg", kBehindJpegStart, "segment(0xFE, b'A\\0comment')"));
    EXPECT_THAT(convert(folder, "s.jpg", "s.png"), IsEmpty());
    const std::string png = folder.text("s.png");
    EXPECT_THAT(png, HasSubstr(std::string("\0\0\0\x11tEXtComment\0A comment", 25)));
    EXPECT_THAT(convert(folder, "s.jpg", "t.jpg"), IsEmpty());
    EXPECT_EQ(readPhotograph(folder / "t.jpg").metadata->texts.at(0).text, std::string("A comment\0\0", 11));
    EXPECT_THAT(convert(folder, "i.jpg", "i.png"), ElementsAre(EndsWith("cannot hold: the comment")));
}

} // namespace
