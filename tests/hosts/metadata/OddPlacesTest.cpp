// What other programs leave in odd places arrives, or is named.

#include "hosts/ChangedFiles.h"
#include "metadata/ExtendedXmp.h"
#include "metadata/ImageResources.h"
#include "metadata/MetadataReader.h"

#include <gmock/gmock.h>

using namespace orvela;

namespace {

using testing::ElementsAre;
using testing::EndsWith;
using testing::HasSubstr;
using testing::IsEmpty;

constexpr char kSmall[] = "convert $S/coffee.png -resize 64x48! -strip ";

TEST(OddPlaces, KeepSegmentsBehindTheBeginningOfAJpeg) {
    const TestFolder folder;
    folder.run(kSmall + std::string("-interlace JPEG s.jpg && python3 -c \"b = open('s.jpg', 'rb').read()\n"
                                    "at = b.index(b'\\xff\\xda', b.index(b'\\xff\\xda') + 2)\n"
                                    "b = b[:at] + b'\\xff\\xfe\\0\\x09between' + b[at:-2] + "
                                    "b'\\xff\\xec\\0\\x0eDuckytail\\0\\0\\0' + "
                                    "b'\\xff\\xe2\\0\\x12ICC_PROFILE\\0\\1\\1ab' + b[-2:]\n"
                                    "open('s.jpg', 'wb').write(b)\""));
    EXPECT_THAT(convert(folder, "s.jpg", "t.jpg"),
                ElementsAre(EndsWith("hold: an ICC profile behind the beginning of the picture")));
    EXPECT_EQ(folder.output("exiftool -s3 -Comment t.jpg"), "between\n");
    EXPECT_THAT(folder.text("t.jpg"), HasSubstr("Duckytail"));
    EXPECT_THAT(convert(folder, "s.jpg", "t.webp"), ElementsAre(EndsWith("; APP12 Duckytail; the comment")));
}

// A phone's film stands behind the pictures of which another segment tells.
TEST(OddPlaces, NameTheFilmOfAPhone) {
    const TestFolder folder;
    folder.run(kSmall + std::string("s.jpg && cp s.jpg m.jpg && ") +
               insert("m.jpg", kBehindJpegStart, "segment(0xE2, b'MPF\\0' + bytes(20))") +
               " && for f in s m; do printf 'MotionPhoto_Data\\0\\0\\0\\030ftypmp42film' >>$f.jpg; done");
    EXPECT_THAT(convert(folder, "s.jpg", "t.jpg"),
                ElementsAre(EndsWith("hold: the film behind the picture")));
    EXPECT_THAT(convert(folder, "m.jpg", "t.png"),
                ElementsAre(EndsWith("(MPF); the film behind the picture")));
}

// Of few programs the resolution is a whole number; a damaged block takes none.
TEST(OddPlaces, MoveTheDensityIntoExif) {
    const TestFolder folder;
    folder.run(
        kSmall + std::string("-units PixelsPerInch -density 300 s.jpg && cp s.jpg d.jpg && ") +
        insert("s.jpg", kBehindJpegStart + 18,
               "segment(0xE1, b'Exif\\0\\0II*\\0\\x08\\0\\0\\0\\2\\0\\x1a\\1\\3\\0\\1\\0\\0\\0"
               "\\x48\\0\\0\\0\\x1b\\1\\3\\0\\1\\0\\0\\0\\x48\\0\\0\\0\\0\\0\\0\\0')") +
        " && " +
        insert("d.jpg", kBehindJpegStart + 18, "segment(0xE1, b'Exif\\0\\0II*\\0\\xff\\xff\\xff\\x7f')"));
    for (const char* target : {"t.webp", "t.heic"}) {
        EXPECT_THAT(convert(folder, "s.jpg", target), IsEmpty());
        EXPECT_EQ(folder.output(std::string("exiftool -a -n -s3 -XResolution -YResolution -ResolutionUnit ") +
                                target),
                  "300\n300\n2\n");
        folder.run(std::string("rm ") + target);
        EXPECT_THAT(convert(folder, "d.jpg", target),
                    ElementsAre(EndsWith("hold: the density"), HasSubstr("damaged")));
    }
    // Without the container's word the whole numbers count.
    folder.run("exiftool -q -overwrite_original -JFIF:ResolutionUnit=None -JFIF:XResolution=1 "
               "-JFIF:YResolution=1 s.jpg");
    EXPECT_NEAR(readPhotograph(folder / "s.jpg").xResolution, 72 / 25.4, 1e-9);
}

std::string xmpWithThumbnail(const std::string& rest) {
    return "<x:xmpmeta xmlns:x='adobe:ns:meta/'><rdf:RDF "
           "xmlns:rdf='http://www.w3.org/1999/02/22-rdf-syntax-ns#'><rdf:Description rdf:about='' "
           "xmlns:dc='http://purl.org/dc/elements/1.1/' xmlns:xmp='http://ns.adobe.com/xap/1.0/' "
           "xmlns:xmpGImg='http://ns.adobe.com/xap/1.0/g/img/'><xmp:Thumbnails><rdf:Alt><rdf:li "
           "rdf:parseType='Resource'><xmpGImg:image>AAAA</xmpGImg:image></rdf:li></rdf:Alt></xmp:Thumbnails>"
           "<dc:format>" +
           rest + "</dc:format></rdf:Description></rdf:RDF></x:xmpmeta>";
}

// Of a JPEG a long packet goes on in further segments.
TEST(OddPlaces, DropThumbnailsInXmp) {
    const TestFolder folder;
    folder.run(kSmall + std::string("s.png"));
    Photograph photograph = readPhotograph(folder / "s.png");
    Metadata whole;
    whole.xmp = copyOf(asBytes(xmpWithThumbnail("short")));
    Metadata parted;
    parted.format = FileFormat::Jpeg;
    PartedXmp parts = partXmp(asBytes(xmpWithThumbnail(std::string(70000, 'l')))).value();
    parted.xmp = std::move(parts.main);
    parted.segments = std::move(parts.segments);
    for (const Metadata& metadata : {whole, parted}) {
        photograph.metadata = std::make_shared<const Metadata>(metadata);
        for (const char* target : {"t.jpg", "t.png"}) {
            EXPECT_THAT(writePhotograph(photograph, folder / target),
                        ElementsAre(EndsWith("hold: the thumbnail")));
            EXPECT_EQ(folder.output(std::string("exiftool -a -G1 -s3 -XMP-xmp:all ") + target), "");
            EXPECT_EQ(folder.output(std::string("exiftool -s3 -XMP-dc:Format ") + target +
                                    " | head -c 5 && rm " + target),
                      metadata.segments.empty() ? "short" : "lllll");
        }
    }
}

TEST(OddPlaces, KeepEveryIptcOfATiff) {
    const TestFolder folder;
    const auto iptc = [](char city) { return Bytes{0x1C, 2, 90, 0, 1, static_cast<std::uint8_t>(city)}; };
    Metadata metadata;
    for (const char city : {'A', 'B', 'C'})
        appendResource(metadata.resources, resource::Iptc, iptc(city));
    folder.run(kSmall + std::string("s.png"));
    Photograph photograph = readPhotograph(folder / "s.png");
    photograph.metadata = std::make_shared<const Metadata>(metadata);
    EXPECT_THAT(writePhotograph(photograph, folder / "s.tif"), IsEmpty());
    EXPECT_THAT(convert(folder, "s.tif", "t.tif"), IsEmpty());
    EXPECT_THAT(convert(folder, "t.tif", "t.jpg"), IsEmpty());
    EXPECT_TRUE(sameResources(readPhotograph(folder / "t.jpg").metadata->resources, metadata.resources));
    EXPECT_THAT(convert(folder, "t.tif", "t.webp"), ElementsAre(EndsWith("hold: IPTC City")));
}

TEST(OddPlaces, NameASecondBlockOfAPsd) {
    Bytes list;
    for (const char* data : {"one", "one", "two"})
        appendResource(list, resource::Xmp, asBytes(std::string_view(data)));
    appendResource(list, resource::Exif3, asBytes(std::string_view("II*")));
    Bytes file(30); // header and an empty palette
    append(file, list.size(), 4, ByteOrder::Big);
    append(file, list);
    append(file, 0, 4, ByteOrder::Big);
    EXPECT_THAT(readMetadata(file, FileFormat::Psd).unheld,
                ElementsAre("a second XMP packet", "a second Exif block"));
}

// A list that held a thumbnail alone does not come back with it.
TEST(OddPlaces, LeaveOutOfATiffWhatWasDropped) {
    const TestFolder folder;
    folder.run(kSmall + std::string("s.png"));
    Metadata metadata;
    appendResource(metadata.resources, resource::Thumbnail, Bytes(40, 7));
    Photograph photograph = readPhotograph(folder / "s.png");
    photograph.metadata = std::make_shared<const Metadata>();
    EXPECT_THAT(writePhotograph(photograph, folder / "s.tif"), IsEmpty());
    folder.put("list", std::string(asText(metadata.resources)));
    folder.run("exiftool -q -overwrite_original -Photoshop:CopyrightFlag#=1 s.tif && "
               "python3 -c \"b = open('s.tif', 'rb').read(); l = open('list', 'rb').read()\n"
               "import struct\n"
               "at = b.index(struct.pack('<HH', 0x8649, 7))\n"
               "b = b[:at + 4] + struct.pack('<II', len(l), len(b)) + b[at + 12:] + l\n"
               "open('s.tif', 'wb').write(b)\"");
    EXPECT_EQ(readPhotograph(folder / "s.tif").metadata->resources, metadata.resources);
    EXPECT_THAT(convert(folder, "s.tif", "t.tif"), ElementsAre(EndsWith("hold: the thumbnail")));
    EXPECT_THAT(readPhotograph(folder / "t.tif").metadata->resources, IsEmpty());
}

} // namespace
