// What the formats hold beside Exif, from each into others.

#include "files/PhotographReader.h"
#include "files/PhotographWriter.h"
#include "files/TiffFields.h"
#include "files/TiffWriter.h"
#include "hosts/ChangedFiles.h"
#include "hosts/TestPhotograph.h"
#include "metadata/ExtendedXmp.h"
#include "metadata/ImageResources.h"
#include "metadata/MetadataReader.h"
#include "metadata/MetadataWriter.h"
#include "metadata/PngMetadata.h"
#include "metadata/TiffMetadata.h"

#include <gmock/gmock.h>

#include <random>

using namespace orvela;

namespace {

using testing::AllOf;
using testing::Contains;
using testing::ElementsAre;
using testing::EndsWith;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;

TEST(Containers, KeepTheirOwnDensityWhateverExifSays) {
    const TestFolder folder;
    folder.run("convert $S/coffee.png -resize 64x48! -strip -units PixelsPerInch -density 300x150 s.jpg && "
               "convert $S/coffee.png -resize 64x48! -strip s.png && exiftool -q -overwrite_original "
               "-PixelUnits=meters "
               "-PixelsPerUnitX=2835 -PixelsPerUnitY=2835 s.png && "
               "convert $S/coffee.png -resize 64x48! -strip -units PixelsPerCentimeter -density 120 s.tif && "
               "cp s.jpg e.jpg && exiftool -q -overwrite_original -Make=M -IFD0:XResolution=72 "
               "-IFD0:YResolution=72 e.jpg && vips copy s.jpg n.jpg[strip] && "
               "exiftool -q -overwrite_original -JFIF:ResolutionUnit=None -JFIF:XResolution=1 "
               "-JFIF:YResolution=1 n.jpg && cp n.jpg h.jpg && exiftool -q -overwrite_original "
               "-IFD0:ResolutionUnit=inches -IFD0:XResolution=240 -IFD0:YResolution=240 h.jpg && "
               "convert s.png -density 0 z.psd");
    const struct {
        const char* source;
        const char* target;
        const char* tags; ///< of one group
        const char* values;
    } cases[] = {
        {"s.jpg", "t.jpg", "JFIF:ResolutionUnit -JFIF:XResolution -JFIF:YResolution", "1 300 150"},
        {"s.jpg", "t.png", "PNG:PixelUnits -PNG:PixelsPerUnitX -PNG:PixelsPerUnitY", "1 11811 5906"},
        {"s.jpg", "t.tif", "IFD0:ResolutionUnit -IFD0:XResolution -IFD0:YResolution", "2 300 150"},
        {"s.jpg", "t.webp", "IFD0:ResolutionUnit -IFD0:XResolution -IFD0:YResolution", "2 300 150"},
        {"e.jpg", "t.jpg", "JFIF:XResolution -IFD0:XResolution", "300 72"},
        {"e.jpg", "t.tif", "IFD0:XResolution -IFD0:YResolution", "300 150"},
        {"e.jpg", "t.webp", "IFD0:XResolution -IFD0:YResolution", "300 150"},
        {"s.png", "t.jpg", "JFIF:ResolutionUnit -JFIF:XResolution", "1 72"}, // 72.009 per inch
        {"s.png", "t.png", "PNG:PixelUnits -PNG:PixelsPerUnitX", "1 2835"},
        {"s.png", "t.tif", "IFD0:ResolutionUnit -IFD0:XResolution", "3 28.35"},
        {"s.tif", "t.jpg", "JFIF:ResolutionUnit -JFIF:XResolution", "2 120"},
        {"s.tif", "t.tif", "IFD0:ResolutionUnit -IFD0:XResolution", "3 120"},
        {"n.jpg", "t.jpg", "JFIF:ResolutionUnit -JFIF:XResolution", "0 1"},
        {"h.jpg", "t.jpg", "IFD0:ResolutionUnit -IFD0:XResolution", "2 240"}, // square pixels say no density
        {"z.psd", "t.png", "PNG:PixelUnits -PNG:PixelsPerUnitX", ""},         // zeros say none
        {"h.jpg", "t.tif", "IFD0:ResolutionUnit -IFD0:XResolution", "2 240"},
    };
    for (const auto& c : cases) {
        EXPECT_THAT(convert(folder, c.source, c.target), IsEmpty()) << c.source << ' ' << c.target;
        EXPECT_EQ(folder.output(std::string("exiftool -n -s3 -") + c.tags + " " + c.target + " | xargs"),
                  std::string(c.values) + "\n")
            << c.source << ' ' << c.target;
        folder.run(std::string("rm ") + c.target);
    }
    EXPECT_NEAR(readPhotograph(folder / "e.jpg").xResolution, 300 / 25.4, 1e-9);
    EXPECT_NEAR(readPhotograph(folder / "h.jpg").xResolution, 240 / 25.4, 1e-9);
    // Of the scan of a wall map, say.
    folder.run("exiftool -q -overwrite_original -XResolution=0.005 -YResolution=0.005 s.tif");
    EXPECT_THAT(convert(folder, "s.tif", "t.jpg"), IsEmpty());
    EXPECT_EQ(folder.output("exiftool -s3 -IFD0:XResolution -IFD0:ResolutionUnit t.jpg | xargs"),
              "0.005 cm\n");
    // Without a unit it is the shape of the pixels, for which not every format has a place.
    folder.run("exiftool -q -overwrite_original -JFIF:YResolution=2 n.jpg");
    EXPECT_THAT(convert(folder, "n.jpg", "t.png"), IsEmpty());
    EXPECT_THAT(convert(folder, "n.jpg", "t.webp"), ElementsAre(EndsWith("hold: the shape of its pixels")));
}

TEST(Containers, CarryTextsAndColoursOfPng) {
    const TestFolder folder;
    folder.run(
        "convert $S/coffee.png -resize 64x48! -strip -define png:exclude-chunks=all s.png && " +
        insert("s.png", kBehindPngHeader,
               "chunk(b'gAMA', struct.pack('>I', 55555)) + chunk(b'cHRM', struct.pack('>8I', *range(8))) "
               "+ chunk(b'tIME', bytes([7, 232, 2, 3, 4, 5, 6])) + chunk(b'bKGD', bytes(6)) "
               "+ chunk(b'tEXt', b'Author\\0A. Writer') + chunk(b'tEXt', b'Comment\\0caf\\xe9') "
               "+ chunk(b'zTXt', b'Title\\0\\0' + zlib.compress(b'A title')) "
               "+ chunk(b'iTXt', b'Copyright\\0\\0\\0\\0\\0' + 'gr\\u00fcn'.encode())"));
    EXPECT_THAT(convert(folder, "s.png", "t.png"), IsEmpty());
    const std::string list = "exiftool -a -s -PNG:all -x Interlace ";
    EXPECT_EQ(folder.output(list + "t.png"), folder.output(list + "s.png"));
    EXPECT_THAT(folder.output(list + "t.png"), HasSubstr("A title"));
    EXPECT_THAT(convert(folder, "s.png", "t.jpg"),
                ElementsAre(EndsWith(
                    "the JPEG file cannot hold: PNG texts Title; PNG chunks gAMA, cHRM, tIME, bKGD")));
    EXPECT_EQ(folder.output("exiftool -s3 -Artist -Copyright -Comment t.jpg"), "A. Writer\ngrün\ncafé\n");
    EXPECT_THAT(convert(folder, "t.jpg", "u.png"), IsEmpty());
    EXPECT_EQ(folder.output("exiftool -s3 -PNG:Comment -EXIF:Artist u.png"), "café\nA. Writer\n");
    // The colours that everybody takes for granted are no loss, nor is what Exif says already.
    folder.run("convert $S/coffee.png -resize 64x48! -strip -define png:exclude-chunks=all p.png && " +
               insert("p.png", kBehindPngHeader,
                      "chunk(b'sRGB', bytes(1)) + chunk(b'gAMA', struct.pack('>I', 45455)) "
                      "+ chunk(b'tEXt', b'Author\\0A') ") +
               " && exiftool -q -overwrite_original -EXIF:Artist=A p.png");
    EXPECT_THAT(convert(folder, "p.png", "p.jpg"), IsEmpty());
}

// What tells of old samples, of a palette or of nothing known does not go.
TEST(Containers, NameSmallChunksThatDoNotTravel) {
    const TestFolder folder;
    folder.run(
        "convert $S/coffee.png -resize 64x48! -strip -define png:exclude-chunks=all s.png && "
        "cp s.png d.png && convert s.png -colors 8 -define png:exclude-chunks=all png8:p.png && "
        "convert s.png w.webp && " +
        insert("s.png", kBehindPngHeader, "chunk(b'sBIT', bytes([8, 8, 8]))") + " && " +
        insert("d.png", kBehindPngHeader, "chunk(b'sBIT', bytes([5, 6, 5]))") + " && " +
        insert("p.png", kBehindPngHeader, "chunk(b'bKGD', bytes(1))") +
        " && python3 -c \"import struct; b = open('w.webp', 'rb').read(); c = b'ABCD' + struct.pack('<I', "
        "4) + bytes(4); h = bytes([0] * 4) + struct.pack('<I', 63)[:3] + struct.pack('<I', 47)[:3]; "
        "b = b'WEBPVP8X' + struct.pack('<I', 10) + h + b[12:] + c; "
        "open('w.webp', 'wb').write(b'RIFF' + struct.pack('<I', len(b)) + b)\"");
    EXPECT_THAT(convert(folder, "s.png", "s.jpg"), IsEmpty());
    EXPECT_THAT(convert(folder, "d.png", "e.png"), ElementsAre(EndsWith("hold: the PNG chunk sBIT")));
    EXPECT_THAT(convert(folder, "p.png", "q.png"), Contains(EndsWith("hold: the PNG chunk bKGD")));
    EXPECT_THAT(convert(folder, "w.webp", "x.webp"), ElementsAre(EndsWith("hold: the WebP chunk ABCD")));
}

TEST(Containers, CarryPhotoshopsResources) {
    const TestFolder folder;
    folder.run("convert $S/coffee.png -resize 64x48! -strip s.jpg && exiftool -q -overwrite_original "
               "-Photoshop:CopyrightFlag=1 -Photoshop:URL=http://example.org -IPTC:Keywords=cup "
               "-IPTC:City=Bonn -Photoshop:XResolution=300 s.jpg");
    const std::string list = "exiftool -a -s -Photoshop:all -IPTC:all ";
    const std::string before = folder.output(list + "-x IPTCDigest s.jpg");
    EXPECT_THAT(before, HasSubstr("example.org"));
    EXPECT_THAT(before, HasSubstr("Bonn"));
    for (const char* middle : {"m.jpg", "m.tif", "m.png"}) {
        EXPECT_THAT(convert(folder, "s.jpg", middle), IsEmpty()) << middle;
        EXPECT_THAT(convert(folder, middle, "t.jpg"), IsEmpty()) << middle;
        EXPECT_EQ(folder.output(list + "-x IPTCDigest t.jpg && rm t.jpg"), before) << middle;
    }
    EXPECT_THAT(folder.output("exiftool -s3 -IPTC:City m.tif m.png"), HasSubstr("Bonn"));
    EXPECT_THAT(convert(folder, "s.jpg", "t.webp"),
                ElementsAre(EndsWith("the WebP file cannot hold: IPTC Keywords, City; Photoshop's data")));
}

// Of an old program the thumbnail has its colours in another order; the new one has them in today's.
TEST(Containers, RenewPhotoshopsThumbnail) {
    const TestFolder folder;
    folder.run("convert -size 40x30 xc:red t.jpg");
    const std::string text = folder.text("t.jpg");
    for (const std::uint16_t id : {resource::Thumbnail, resource::ThumbnailBgr}) {
        Metadata metadata;
        appendResource(metadata.resources, resource::Iptc, asBytes("odd"));
        Bytes data(28);
        append(data, asBytes(text));
        appendResource(metadata.resources, id, data);
        appendResource(metadata.resources, 0x0BB7, asBytes("path"));
        Photograph photograph =
            testPhotograph(ColorModel::Rgb, 8, 90, 90, [](std::size_t i) { return 100 + 50 * (i % 3); });
        photograph.metadata = std::make_shared<const Metadata>(metadata);
        EXPECT_THAT(writePhotograph(photograph, folder / "t.tif"), IsEmpty());
        folder.run("exiftool -b -PhotoshopThumbnail t.tif >new.jpg");
        EXPECT_EQ(
            folder.output("convert new.jpg -format '%wx%h ' info: && convert new.jpg -crop 1x1+20+15 -format "
                          "'%[fx:round(255*r)] %[fx:round(255*g)] ' info: && convert new.jpg -crop 1x1+1+15 "
                          "-format '%[fx:r<0.04]' info:"),
            "40x30 100 150 1"); // the picture, and black beside it
        EXPECT_TRUE(sameResources(
            withoutResources(readPhotograph(folder / "t.tif").metadata->resources, {resource::Thumbnail}),
            withoutResources(metadata.resources, {id})));
        folder.run("rm t.tif");
    }
}

TEST(Containers, ReadPsd) {
    const TestFolder folder;
    folder.run("convert $S/coffee.png -resize 64x48! -strip -units PixelsPerInch -density 150 s.psd && "
               "exiftool -q -overwrite_original -IPTC:City=Bonn -XMP:Title=T -EXIF:Artist=A s.psd && "
               "convert $S/coffee.png -resize 64x48! '(' +clone -negate ')' '(' +clone ')' layers.psd");
    EXPECT_THAT(convert(folder, "s.psd", "t.jpg"), IsEmpty());
    EXPECT_EQ(folder.output("exiftool -s3 -IPTC:City -XMP:Title -EXIF:Artist -JFIF:XResolution t.jpg"),
              "Bonn\nT\nA\n150\n");
    EXPECT_THAT(convert(folder, "layers.psd", "t.tif"), ElementsAre(EndsWith("cannot hold: the layers")));
}

TEST(Containers, KeepSegmentsOfJpegAndNameWhatWouldLie) {
    const TestFolder folder;
    folder.run("convert $S/coffee.png -resize 64x48! -strip s.jpg && " +
               insert("s.jpg", kBehindJpegStart,
                      "segment(0xEC, b'Ducky' + bytes(9)) + segment(0xE2, b'MPF\\0' + bytes(20)) "
                      "+ segment(0xE1, b'QVCI' + bytes(5)) "
                      "+ segment(0xE0, b'II\\x1a\\0\\0\\0HEAPJPGM' + bytes(30))") +
               " && printf 'more pictures' >>s.jpg");
    EXPECT_THAT(convert(folder, "s.jpg", "t.jpg"),
                ElementsAre(EndsWith("the JPEG file cannot hold: the further pictures (MPF)")));
    EXPECT_EQ(readPhotograph(folder / "t.jpg").metadata->segments,
              readPhotograph(folder / "s.jpg").metadata->segments);
    EXPECT_THAT(folder.text("t.jpg"), HasSubstr("HEAPJPGM"));
    EXPECT_THAT(convert(folder, "s.jpg", "t.png"),
                ElementsAre(EndsWith("(MPF); APP0 CIFF; APP12 Ducky; APP1 QVCI")));
    folder.run("convert $S/coffee.png -resize 64x48! -strip r.jpg && printf '12345\\0\\0\\0' >>r.jpg");
    EXPECT_THAT(convert(folder, "r.jpg", "u.jpg"), ElementsAre(EndsWith("5 bytes behind the picture")));
}

// A segment of a JPEG ends after 64 KiB.
TEST(Containers, SplitLongXmpAndShortenLongExif) {
    const TestFolder folder;
    folder.run("convert $S/coffee.png -resize 160x120! t.jpg && convert $S/coffee.png -resize 64x48! -strip "
               "s.png && "
               "python3 -c \"open('long', 'w').write('word ' * 30000)\" && exiftool -q -overwrite_original "
               "'-XMP-dc:Description<=long' s.png");
    EXPECT_THAT(convert(folder, "s.png", "t.jpg.jpg"), IsEmpty());
    EXPECT_EQ(folder.output("exiftool -b -XMP-dc:Description t.jpg.jpg"), folder.text("long"));
    EXPECT_THAT(convert(folder, "t.jpg.jpg", "u.png"), IsEmpty());
    EXPECT_EQ(folder.output("exiftool -b -XMP-dc:Description u.png"), folder.text("long"));

    Metadata metadata;
    ExifBlock block({});
    block.add({{tiff::Artist, tiff::Ascii, 60000, Bytes(60000, 'a')}});
    Bytes exif = block.bytes();
    const std::size_t directory = exif.size(); // of a thumbnail, which goes on behind it
    append(exif, 2, 2, ByteOrder::Little);
    for (const auto& [tag, value] :
         {std::pair(tiff::JpegOffset, directory + 30), {tiff::JpegLength, std::size_t{9000}}}) {
        append(exif, tag, 2, ByteOrder::Little);
        append(exif, tiff::Long, 2, ByteOrder::Little);
        append(exif, 1, 4, ByteOrder::Little);
        append(exif, value, 4, ByteOrder::Little);
    }
    append(exif, 0, 4, ByteOrder::Little);
    exif.resize(exif.size() + 9000);
    store(exif, directory - 4, directory, 4, ByteOrder::Little);
    metadata.exif = exif;
    const ThumbnailMaker none = [](int, int, int) { return Bytes(); };
    const PreparedMetadata fits = prepareMetadata(metadata, FileFormat::Jpeg, {1, 1, none});
    EXPECT_EQ(fits.metadata.exif.size(), directory + 30);
    EXPECT_THAT(fits.lost, ElementsAre("the thumbnail"));
    block.add({{tiff::Copyright, tiff::Ascii, 9000, Bytes(9000, 'c')}});
    metadata.exif = block.bytes();
    const PreparedMetadata tooLong = prepareMetadata(metadata, FileFormat::Jpeg, {1, 1, none});
    EXPECT_TRUE(tooLong.metadata.exif.empty());
    // From a JPEG that holds it in several segments it goes into one that does.
    folder.run("mkdir more");
    metadata.format = FileFormat::Jpeg;
    Photograph photograph = readPhotograph(folder / "t.jpg");
    photograph.metadata = std::make_shared<const Metadata>(metadata);
    EXPECT_THAT(writePhotograph(photograph, folder / "more/t.jpg"), IsEmpty());
    EXPECT_EQ(readPhotograph(folder / "more/t.jpg").metadata->exif, metadata.exif);
    EXPECT_THAT(tooLong.lost, ElementsAre(HasSubstr("64 KiB")));
}

// The parts in any order, beside what the main packet itself says.
TEST(Containers, JoinXmpOfSeveralSegments) {
    const auto packet = [](const std::string& tree) {
        return "<x:xmpmeta xmlns:x='adobe:ns:meta/'>\n<rdf:RDF "
               "xmlns:rdf='http://www.w3.org/1999/02/22-rdf-syntax-ns#'><rdf:Description rdf:about='' " +
               tree + "/></rdf:RDF>\n</x:xmpmeta>";
    };
    const std::string other =
        packet("xmlns:x1='http://example.org/' x1:Long='" + std::string(70000, 'l') + "'");
    std::vector<Chunk> segments = partXmp(asBytes(other)).value().segments;
    ASSERT_EQ(segments.size(), 2U);
    std::swap(segments[0], segments[1]);
    const std::string id(asText(ByteView(segments[0].data).subspan(35, 32)));
    const std::string main = packet("xmlns:tiff='http://ns.adobe.com/tiff/1.0/' tiff:Make='M' "
                                    "xmlns:xmpNote='http://ns.adobe.com/xmp/note/' xmpNote:HasExtendedXMP='" +
                                    id + "'");
    const Bytes joined = joinXmp(asBytes(main), segments).value();
    EXPECT_THAT(std::string(asText(joined)),
                AllOf(HasSubstr("tiff:Make='M'"), HasSubstr("x1:Long='lll"), Not(HasSubstr(id))));
    EXPECT_FALSE(joinXmp(asBytes(packet("")), segments));
    segments.pop_back();
    EXPECT_FALSE(joinXmp(asBytes(main), segments));
}

TEST(Containers, ReadAndWriteBigTiff) {
    const TestFolder folder;
    const std::string camera = std::string(ORVELA_PHOTOS "/camera/canon-powershot-s40.jpg");
    Photograph photograph = readPhotograph(camera);
    Metadata metadata = *photograph.metadata;
    metadata.xmp = copyOf(asBytes("<x:xmpmeta xmlns:x='adobe:ns:meta/'/>"));
    std::vector<std::string> lost;
    TargetFile file(folder / "t.tif");
    TiffWriter writer(file, ByteOrder::Little, metadata.exif, nullptr, 1000);
    writer.addPicture(photograph, tiffStorage(photograph, {}),
                      pageFields(photograph, metadata, ByteOrder::Little, lost));
    writer.finish();
    file.commit(false);
    EXPECT_THAT(lost, IsEmpty());
    const std::string notes = "exiftool -a -G1 -s -MakerNotes:all -x PreviewImageStart ";
    EXPECT_EQ(folder.output(notes + "t.tif"), folder.output(notes + camera));
    const Photograph read = readPhotograph(folder / "t.tif");
    EXPECT_EQ(read.width, photograph.width);
    EXPECT_EQ(read.metadata->xmp, metadata.xmp);
    writePhotograph(read, folder / "u.jpg");
    const std::string list = "-ExifIFD:all -InteropIFD:all -x ExifImageWidth -x ExifImageHeight ";
    EXPECT_EQ(folder.output(notes + list + "u.jpg"), folder.output(notes + list + camera));
}

// Where the note cannot keep its distance the metadata library lays the block out anew.
TEST(Containers, MoveAMakerNoteFromTheEndOfATiff) {
    const TestFolder folder;
    const std::string camera = ORVELA_PHOTOS "/camera/fujifilm-finepix-2400zoom.jpg";
    folder.run(
        "exiftool -b -MakerNoteFujiFilm " + camera + " >note && python3 -c \"import struct\n" +
        "note = open('note', 'rb').read()\n"
        "def ifd(*e): return struct.pack('<H', len(e)) + b''.join(struct.pack('<HHII', *x) for x in e) + "
        "bytes(4)\n"
        "exif = ifd((0x8827, 3, 1, 200), (0x927C, 7, len(note), 90100))\n"
        "page = ifd((256, 3, 1, 300), (257, 3, 1, 300), (258, 3, 1, 8), (259, 3, 1, 1), (262, 3, 1, 1), "
        "(271, 2, 9, 90050), (273, 4, 1, 8), (277, 3, 1, 1), (278, 3, 1, 300), (279, 4, 1, 90000), "
        "(0x8769, 4, 1, 90060))\n"
        "b = bytearray(90100) + note\n"
        "b[:8] = struct.pack('<2sHI', b'II', 42, len(b))\n"
        "b[90050:90059] = b'FUJIFILM\\0'\n"
        "b[90060:90060 + len(exif)] = exif\n"
        "open('s.tif', 'wb').write(b + page)\"");
    const std::string list = "exiftool -a -s -MakerNotes:all -ISO ";
    EXPECT_EQ(folder.output("exiftool -s3 -ISO s.tif"), "200\n");
    for (const char* target : {"t.jpg", "t.tif"}) {
        EXPECT_THAT(convert(folder, "s.tif", target), IsEmpty()) << target;
        EXPECT_EQ(folder.output(list + target), folder.output(list + "s.tif")) << target;
    }
    EXPECT_THAT(folder.output(list + "t.jpg"), HasSubstr("Sharpness"));
}

// Whatever the bytes of a file are, reading them, making them ready and writing them ends well.
TEST(Containers, SurviveMutations) {
    const TestFolder folder;
    folder.run("cp " ORVELA_PHOTOS "/camera/nikon-e950.jpg s.jpg && exiftool -q -overwrite_original "
               "-IPTC:City=Bonn -Photoshop:CopyrightFlag=1 -XMP:Title=T -Comment=C s.jpg && "
               "convert s.jpg s.psd");
    for (const char* name : {"s.png", "s.tif", "s.webp", "s.heic"})
        convert(folder, "s.jpg", name);
    std::mt19937 random(2);
    const ThumbnailMaker none = [](int, int, int) { return Bytes(); };
    for (const char* name : {"s.jpg", "s.png", "s.tif", "s.webp", "s.heic", "s.psd"}) {
        const std::string text = folder.text(name);
        const Bytes whole = copyOf(asBytes(text));
        const FileFormat format = formatOfContent(whole).value();
        for (int run = 0; run < 150; ++run) {
            Bytes mutant = whole;
            for (int i = 0; i < 6; ++i)
                mutant[random() % (i < 4 ? std::min<std::size_t>(6000, whole.size()) : whole.size())] =
                    static_cast<std::uint8_t>(random());
            if (run % 3 == 0)
                mutant.resize(random() % mutant.size());
            const Metadata metadata = readMetadata(mutant, format);
            for (const FileFormat target : {FileFormat::Jpeg, FileFormat::Png, FileFormat::Tiff}) {
                PreparedMetadata prepared = prepareMetadata(metadata, target, {8, 8, none});
                Bytes encoded = target == FileFormat::Tiff
                                    ? Bytes{'I', 'I', 42, 0, 8, 0, 0, 0, 0, 0, 0, 0, 0, 0}
                                    : Bytes{0xFF, 0xD8, 0xFF, 0xDA, 0, 2, 0xFF, 0xD9};
                embedMetadata(prepared, encoded);
                metadataNotes(prepared);
            }
        }
    }
}

} // namespace
