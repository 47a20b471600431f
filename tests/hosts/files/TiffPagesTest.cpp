#include "files/PhotographReader.h"
#include "files/PhotographWriter.h"
#include "files/TiffFields.h"
#include "files/TiffWriter.h"
#include "hosts/TestFiles.h"
#include "metadata/MetadataWriter.h"

#include <gmock/gmock.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <tiffio.h>

#include <cmath>
#include <iomanip>
#include <map>
#include <memory>
#include <sstream>

using namespace orvela;

namespace {

namespace fs = std::filesystem;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

struct TiffRelease {
    void operator()(TIFF* tiff) const { TIFFClose(tiff); }
};
using Tiff = std::unique_ptr<TIFF, TiffRelease>;

Tiff openTiff(const fs::path& path, const char* mode) {
    return Tiff(TIFFOpen(path.c_str(), mode));
}

constexpr std::uint32_t kRows = 7; // of a strip

// How a page is stored, and what libtiff knows of it.
struct Page {
    int width;
    int height;
    int bits;
    int samples;
    int photometric;
    int compression = COMPRESSION_NONE;
    int predictor = 0;
    int planar = PLANARCONFIG_CONTIG;
    int tile = 0;
    int extra = -1;
    int subfile = FILETYPE_PAGE;
};

// Samples that differ from page to page and hardly repeat. A transparency that is multiplied into the colour
// is not below it.
Bytes contentOf(tmsize_t size, const Page& page, int seed) {
    Bytes bytes(static_cast<std::size_t>(size));
    for (std::size_t i = 0; i < bytes.size(); ++i)
        bytes[i] = static_cast<std::uint8_t>((i * i + static_cast<std::size_t>(seed) * 31) % 251);
    auto* samples = reinterpret_cast<std::uint16_t*>(bytes.data());
    for (std::size_t i = 0; page.extra == EXTRASAMPLE_ASSOCALPHA && i < bytes.size() / 2; i += 2)
        if (samples[i] > samples[i + 1])
            std::swap(samples[i], samples[i + 1]);
    return bytes;
}

void writePage(TIFF* tiff, const Page& page, int number) {
    TIFFSetField(tiff, TIFFTAG_IMAGEWIDTH, page.width);
    TIFFSetField(tiff, TIFFTAG_IMAGELENGTH, page.height);
    TIFFSetField(tiff, TIFFTAG_BITSPERSAMPLE, page.bits);
    TIFFSetField(tiff, TIFFTAG_SAMPLESPERPIXEL, page.samples);
    TIFFSetField(tiff, TIFFTAG_PHOTOMETRIC, page.photometric);
    TIFFSetField(tiff, TIFFTAG_COMPRESSION, page.compression);
    TIFFSetField(tiff, TIFFTAG_PLANARCONFIG, page.planar);
    TIFFSetField(tiff, TIFFTAG_SUBFILETYPE, page.subfile);
    if (page.predictor != 0)
        TIFFSetField(tiff, TIFFTAG_PREDICTOR, page.predictor);
    const auto extra = static_cast<std::uint16_t>(page.extra);
    if (page.extra >= 0)
        TIFFSetField(tiff, TIFFTAG_EXTRASAMPLES, 1, &extra);
    const std::string name = "page " + std::to_string(number);
    for (const int tag : {TIFFTAG_PAGENAME, TIFFTAG_DOCUMENTNAME, TIFFTAG_IMAGEDESCRIPTION, TIFFTAG_SOFTWARE,
                          TIFFTAG_ARTIST, TIFFTAG_COPYRIGHT})
        TIFFSetField(tiff, static_cast<std::uint32_t>(tag), (name + " " + std::to_string(tag)).c_str());
    TIFFSetField(tiff, TIFFTAG_DATETIME, ("2020:01:02 03:04:0" + std::to_string(number)).c_str());
    TIFFSetField(tiff, TIFFTAG_PAGENUMBER, number, 9);
    TIFFSetField(tiff, TIFFTAG_XRESOLUTION, 100.25 + number);
    TIFFSetField(tiff, TIFFTAG_YRESOLUTION, 50.5 + number);
    TIFFSetField(tiff, TIFFTAG_RESOLUTIONUNIT, RESUNIT_CENTIMETER);
    const std::string xmp = "<x:xmpmeta xmlns:x='adobe:ns:meta/' x:xmptk='" + name + "'/>";
    TIFFSetField(tiff, TIFFTAG_XMLPACKET, static_cast<std::uint32_t>(xmp.size()), xmp.data());
    const Bytes profile(static_cast<std::size_t>(200 + number), 7);
    TIFFSetField(tiff, TIFFTAG_ICCPROFILE, static_cast<std::uint32_t>(profile.size()), profile.data());

    if (page.tile == 0)
        TIFFSetField(tiff, TIFFTAG_ROWSPERSTRIP, kRows);
    else {
        TIFFSetField(tiff, TIFFTAG_TILEWIDTH, page.tile);
        TIFFSetField(tiff, TIFFTAG_TILELENGTH, page.tile);
    }
    const std::uint32_t blocks = page.tile > 0 ? TIFFNumberOfTiles(tiff) : TIFFNumberOfStrips(tiff);
    const std::uint32_t each =
        (static_cast<std::uint32_t>(page.height) + kRows - 1) / kRows; // strips of a plane
    for (std::uint32_t i = 0; i < blocks; ++i) {
        const std::uint32_t rows =
            std::min(kRows, static_cast<std::uint32_t>(page.height) - i % each * kRows);
        Bytes bytes =
            contentOf(page.tile > 0 ? TIFFTileSize(tiff) : TIFFVStripSize(tiff, rows), page, number);
        const auto size = static_cast<tmsize_t>(bytes.size());
        EXPECT_GT(page.tile > 0 ? TIFFWriteEncodedTile(tiff, i, bytes.data(), size)
                                : TIFFWriteEncodedStrip(tiff, i, bytes.data(), size),
                  0);
    }
    EXPECT_EQ(TIFFWriteDirectory(tiff), 1);
}

void writeTiff(const fs::path& path, const char* mode, const std::vector<Page>& pages) {
    const Tiff tiff = openTiff(path, mode);
    int number = 0;
    for (const Page& page : pages)
        writePage(tiff.get(), page, number++);
}

// All that libtiff tells about the current page except where its blocks are and how many rows they have.
std::string told(TIFF* tiff) {
    std::FILE* file = std::tmpfile();
    TIFFPrintDirectory(tiff, file, TIFFPRINT_NONE);
    std::rewind(file);
    std::string text;
    std::array<char, 500> line{};
    while (std::fgets(line.data(), line.size(), file) != nullptr) {
        const std::string_view view = line.data();
        if (view.find("TIFF Directory at") == view.npos && view.find("Rows/Strip") == view.npos)
            text += view;
    }
    std::fclose(file);
    return text;
}

// The rows of all planes as they are decoded.
Bytes samplesOf(TIFF* tiff) {
    Bytes bytes;
    std::uint32_t height = 0;
    std::uint16_t planar = 0;
    std::uint16_t samples = 0;
    TIFFGetField(tiff, TIFFTAG_IMAGELENGTH, &height);
    TIFFGetField(tiff, TIFFTAG_PLANARCONFIG, &planar);
    TIFFGetField(tiff, TIFFTAG_SAMPLESPERPIXEL, &samples);
    const std::uint16_t planes = planar == PLANARCONFIG_SEPARATE ? samples : std::uint16_t{1};
    Bytes block(static_cast<std::size_t>(TIFFIsTiled(tiff) ? TIFFTileSize(tiff) : TIFFScanlineSize(tiff)));
    for (std::uint32_t i = 0; TIFFIsTiled(tiff) && i < TIFFNumberOfTiles(tiff); ++i) {
        EXPECT_GT(TIFFReadEncodedTile(tiff, i, block.data(), -1), 0);
        bytes.insert(bytes.end(), block.begin(), block.end());
    }
    for (std::uint16_t plane = 0; plane < planes; ++plane)
        for (std::uint32_t row = 0; !TIFFIsTiled(tiff) && row < height; ++row) {
            EXPECT_EQ(TIFFReadScanline(tiff, block.data(), row, plane), 1);
            bytes.insert(bytes.end(), block.begin(), block.end());
        }
    return bytes;
}

std::vector<std::string> rewrite(const fs::path& source, const fs::path& target) {
    PhotographReader reader(source);
    PhotographWriter writer(target, {});
    for (int page = 0; page < reader.pages(); ++page)
        writer.add(reader.next());
    return writer.commit();
}

const std::vector<Page> kPages = {
    {40, 31, 8, 3, PHOTOMETRIC_RGB, COMPRESSION_LZW, PREDICTOR_HORIZONTAL},
    {23, 50, 16, 4, PHOTOMETRIC_SEPARATED, COMPRESSION_ADOBE_DEFLATE, PREDICTOR_NONE},
    {64, 32, 8, 1, PHOTOMETRIC_MINISWHITE, COMPRESSION_PACKBITS, 0, PLANARCONFIG_CONTIG, 0, -1,
     FILETYPE_REDUCEDIMAGE},
    {30, 20, 16, 2, PHOTOMETRIC_MINISBLACK, COMPRESSION_NONE, 0, PLANARCONFIG_CONTIG, 0,
     EXTRASAMPLE_ASSOCALPHA},
    {33, 9, 16, 3, PHOTOMETRIC_RGB, COMPRESSION_ADOBE_DEFLATE, PREDICTOR_HORIZONTAL, PLANARCONFIG_SEPARATE},
    {48, 32, 8, 4, PHOTOMETRIC_RGB, COMPRESSION_ZSTD, PREDICTOR_HORIZONTAL, PLANARCONFIG_CONTIG, 16,
     EXTRASAMPLE_UNASSALPHA},
    {19, 11, 1, 1, PHOTOMETRIC_MASK, COMPRESSION_CCITTFAX4, 0, PLANARCONFIG_CONTIG, 0, -1, FILETYPE_MASK}};

// Classic and large, of either byte order; the result is large only when it has to be.
TEST(TiffPages, KeepHowTheyAreStoredAndWhatTheySay) {
    const TestFolder folder;
    for (const char* mode : {"wl", "wb", "w8l", "w8b"}) {
        writeTiff(folder / "s.tif", mode, kPages);
        fs::remove(folder / "t.tif");
        EXPECT_THAT(rewrite(folder / "s.tif", folder / "t.tif"), IsEmpty());
        const Tiff before = openTiff(folder / "s.tif", "r");
        const Tiff after = openTiff(folder / "t.tif", "r");
        ASSERT_TRUE(after);
        EXPECT_EQ(TIFFIsBigEndian(before.get()), TIFFIsBigEndian(after.get()));
        EXPECT_FALSE(TIFFIsBigTIFF(after.get()));
        ASSERT_EQ(TIFFNumberOfDirectories(after.get()), kPages.size());
        for (tdir_t page = 0; page < kPages.size(); ++page) {
            TIFFSetDirectory(before.get(), page);
            TIFFSetDirectory(after.get(), page);
            EXPECT_EQ(told(before.get()), told(after.get())) << mode << page;
            EXPECT_EQ(samplesOf(before.get()), samplesOf(after.get())) << mode << page;
        }
    }
}

// The limit of four gigabytes, moved within reach. The Exif directory takes the form of the file.
TEST(TiffPages, BecomeABigTiffOnlyWhereOffsetsNeedIt) {
    const TestFolder folder;
    folder.run("convert $S/coffee.png -resize 64x48! s.tif && exiftool -q -overwrite_original -ISO=200 "
               "-FNumber=5.6 -GPSLatitude=48.5 -GPSLatitudeRef=N -InteropIndex=R98 -UserComment=abc s.tif");
    const Photograph photograph = readPhotograph(folder / "s.tif");
    const Metadata& metadata = *photograph.metadata;
    std::vector<std::string> lost;
    const std::vector<TiffField> fields = pageFields(photograph, metadata, ByteOrder::Little, lost);
    const auto write = [&](const char* name, std::uint64_t limit) {
        TargetFile file(folder / name);
        TiffWriter writer(file, ByteOrder::Little, metadata.exif, nullptr, limit);
        writer.addPicture(photograph, tiffStorage(photograph, {}), fields);
        writer.finish();
        file.commit(false);
        return file.size();
    };
    const std::uint64_t size = write("classic.tif", TiffWriter::kClassicLimit);
    write("large.tif", size / 2);
    EXPECT_FALSE(TIFFIsBigTIFF(openTiff(folder / "classic.tif", "r").get()));
    const std::string tags = "exiftool -a -u -G1 -s -ExifIFD:all -GPS:all -InteropIFD:all ";
    const std::string wanted = folder.output(tags + "s.tif");
    EXPECT_THAT(wanted, AllOf(HasSubstr("FNumber "), HasSubstr("GPSLatitude "), HasSubstr("InteropIndex ")));
    EXPECT_EQ(folder.output(tags + "classic.tif"), wanted);
    const Tiff large = openTiff(folder / "large.tif", "r");
    EXPECT_TRUE(TIFFIsBigTIFF(large.get()));
    std::uint64_t exif = 0;
    std::uint64_t gps = 0;
    float number = 0;
    const char* north = "";
    EXPECT_EQ(TIFFGetField(large.get(), TIFFTAG_EXIFIFD, &exif) +
                  TIFFGetField(large.get(), TIFFTAG_GPSIFD, &gps),
              2);
    EXPECT_EQ(TIFFReadEXIFDirectory(large.get(), exif), 1);
    EXPECT_EQ(TIFFGetField(large.get(), EXIFTAG_FNUMBER, &number), 1);
    EXPECT_FLOAT_EQ(number, 5.6F);
    EXPECT_EQ(TIFFReadGPSDirectory(large.get(), gps), 1);
    EXPECT_EQ(TIFFGetField(large.get(), GPSTAG_LATITUDEREF, &north), 1);
    EXPECT_STREQ(north, "N");
    folder.run("convert s.tif rgb:s && convert classic.tif rgb:c && convert large.tif rgb:l && "
               "cmp s c && cmp s l");
}

// A maker note whose long values stand at offsets from the beginning of the Exif block: they hold only as
// long as the note stays where it is.
TEST(TiffPages, FollowAnExifBlockThatTheFileBeginsWith) {
    const TestFolder folder;
    folder.run("cp $S/rocket.jpg s.jpg && exiv2 -M'set Exif.Image.Make Canon' -M'set Exif.Canon.OwnerName "
               "A. Person of a long name' -M'set Exif.Canon.FirmwareVersion Firmware 1.0.2' mo s.jpg && "
               "exiftool -b -Exif s.jpg >block && exiftool -a -u -G1 -s -ee -MakerNotes:all s.jpg >wanted && "
               "test $(wc -l <wanted) -gt 1");
    const std::string block = folder.text("block");
    const Photograph photograph = readPhotograph(folder / "s.jpg");
    ASSERT_EQ(asText(photograph.metadata->exif), block);
    std::vector<std::string> lost;
    const auto fields = pageFields(photograph, *photograph.metadata, ByteOrder::Little, lost);
    for (const std::uint64_t limit : {TiffWriter::kClassicLimit, std::uint64_t{1000}}) {
        TargetFile file(folder / "t.tif");
        TiffWriter writer(file, ByteOrder::Little, photograph.metadata->exif, nullptr, limit);
        writer.addPicture(photograph, tiffStorage(photograph, {}), fields);
        writer.finish();
        file.commit(true);
        EXPECT_EQ(file.size() > 1000 && limit == 1000,
                  TIFFIsBigTIFF(openTiff(folder / "t.tif", "r").get()) == 1);
        EXPECT_EQ(folder.text("t.tif").substr(16, block.size() - 16), block.substr(16));
        folder.run(
            "exiftool -a -u -G1 -s -ee -MakerNotes:all t.tif | diff wanted - && convert s.jpg rgb:s && "
            "convert t.tif rgb:t && cmp s t");
    }
    // And from there into another TIFF.
    EXPECT_THAT(rewrite(folder / "t.tif", folder / "u.tif"), IsEmpty());
    folder.run("exiftool -a -u -G1 -s -ee -MakerNotes:all u.tif | diff wanted -");
}

// Of one colour for each unit of the subsampling: R = Y + 1.402 (Cr - 128), B = Y + 1.772 (Cb - 128),
// G = (Y - 0.299 R - 0.114 B) / 0.587, within a level of rounding.
TEST(TiffPages, OfYcbcrBecomeRgb) {
    const TestFolder folder;
    const auto luma = [](int x, int y) { return 60 + 5 * (x + 2 * y); };
    const auto blue = [](int x, int y) { return 90 + 11 * x + 2 * y; };
    const auto red = [](int x, int y) { return 170 - 9 * x - 3 * y; };
    for (const int compression :
         {COMPRESSION_NONE, COMPRESSION_LZW, COMPRESSION_ADOBE_DEFLATE, COMPRESSION_PACKBITS})
        for (const auto& [across, down] : {std::pair(1, 1), {2, 1}, {2, 2}}) {
            Bytes units;
            for (int y = 0; y < 8; y += down)
                for (int x = 0; x < 12; x += across) {
                    for (int i = 0; i < across * down; ++i)
                        units.push_back(static_cast<std::uint8_t>(luma(x + i % across, y + i / across)));
                    units.push_back(static_cast<std::uint8_t>(blue(x / across, y / down)));
                    units.push_back(static_cast<std::uint8_t>(red(x / across, y / down)));
                }
            {
                const Tiff tiff = openTiff(folder / "s.tif", "w");
                TIFFSetField(tiff.get(), TIFFTAG_IMAGEWIDTH, 12);
                TIFFSetField(tiff.get(), TIFFTAG_IMAGELENGTH, 8);
                TIFFSetField(tiff.get(), TIFFTAG_BITSPERSAMPLE, 8);
                TIFFSetField(tiff.get(), TIFFTAG_SAMPLESPERPIXEL, 3);
                TIFFSetField(tiff.get(), TIFFTAG_PHOTOMETRIC, PHOTOMETRIC_YCBCR);
                TIFFSetField(tiff.get(), TIFFTAG_YCBCRSUBSAMPLING, across, down);
                TIFFSetField(tiff.get(), TIFFTAG_COMPRESSION, compression);
                TIFFSetField(tiff.get(), TIFFTAG_ROWSPERSTRIP, 4);
                const std::size_t half = units.size() / 2;
                for (std::uint32_t i = 0; i < 2; ++i)
                    EXPECT_GT(TIFFWriteEncodedStrip(tiff.get(), i, units.data() + i * half,
                                                    static_cast<tmsize_t>(half)),
                              0);
            }
            fs::remove(folder / "t.tif");
            EXPECT_THAT(rewrite(folder / "s.tif", folder / "t.tif"), ElementsAre(HasSubstr("YCbCr")));
            const Photograph result = readPhotograph(folder / "t.tif");
            ASSERT_EQ(result.samples.size(), 12U * 8 * 3);
            for (int y = 0; y < 8; ++y)
                for (int x = 0; x < 12; ++x) {
                    const std::uint8_t* pixel = result.samples.data() + (y * 12 + x) * 3;
                    const double r = luma(x, y) + 1.402 * (red(x / across, y / down) - 128);
                    const double b = luma(x, y) + 1.772 * (blue(x / across, y / down) - 128);
                    const double g = (luma(x, y) - 0.299 * r - 0.114 * b) / 0.587;
                    EXPECT_NEAR(pixel[0], std::clamp(r, 0.0, 255.0), 1) << compression << across << down;
                    EXPECT_NEAR(pixel[1], std::clamp(g, 0.0, 255.0), 1) << x << ' ' << y;
                    EXPECT_NEAR(pixel[2], std::clamp(b, 0.0, 255.0), 1) << x << ' ' << y;
                }
            std::vector<std::uint32_t> raster(12 * 8);
            TIFFReadRGBAImageOriented(openTiff(folder / "s.tif", "r").get(), 12, 8, raster.data(),
                                      ORIENTATION_TOPLEFT, 1);
            for (std::size_t i = 0; i < raster.size(); ++i)
                EXPECT_EQ(TIFFGetG(raster[i]), result.samples[i * 3 + 1]);
        }
}

// What pages that are stored in ways that are not written become.
TEST(TiffPages, TellWhatTheyBecome) {
    const TestFolder folder;
    folder.run(
        "convert $S/coffee.png -resize 64x48! p.png && convert p.png -monochrome -compress Group4 bits.tif "
        "&& "
        "convert p.png -colors 16 png8:q.png && convert q.png -type Palette -compress LZW palette.tif && "
        "vips tiffsave p.png jpeg.tif "
        "--compression jpeg --Q 71 && exiftool -q -overwrite_original -m '-ImageSourceData<=p.png' jpeg.tif");
    EXPECT_THAT(rewrite(folder / "bits.tif", folder / "b.tif"),
                ElementsAre(HasSubstr("cannot hold: its kind of compression (lzw is written)"),
                            HasSubstr("expanded to 8 bits")));
    EXPECT_THAT(rewrite(folder / "palette.tif", folder / "p.tif"),
                ElementsAre(HasSubstr("palette was resolved")));
    EXPECT_THAT(rewrite(folder / "jpeg.tif", folder / "j.tif"), ElementsAre(HasSubstr("the layers")));
    folder.run(
        "convert bits.tif -depth 8 gray:s && convert b.tif gray:t && cmp s t && convert palette.tif -depth 8 "
        "rgb:s && convert "
        "p.tif rgb:t && cmp s t");
    EXPECT_EQ(readPhotograph(folder / "j.tif").encoding.quality, 71);
    EXPECT_EQ(folder.output("exiftool -s3 -Compression -YCbCrSubSampling j.tif"), "JPEG\nYCbCr4:2:0 (2 2)\n");
}

// A preview before the data of a sensor is none of them; one smaller picture below another is no raw file.
TEST(TiffPages, OfCameraRawFilesAreRefused) {
    const TestFolder folder;
    for (const int below : {PHOTOMETRIC_RGB, PHOTOMETRIC_CFA}) {
        {
            const Tiff tiff = openTiff(folder / "s.tif", "w");
            toff_t places[] = {0};
            TIFFSetField(tiff.get(), TIFFTAG_SUBIFD, 1, places);
            writePage(tiff.get(), kPages[0], 0);
            Page page = {16, 14, 8, 1, below};
            page.samples = below == PHOTOMETRIC_RGB ? 3 : 1;
            writePage(tiff.get(), page, 1);
        }
        if (below == PHOTOMETRIC_RGB) {
            EXPECT_THAT(rewrite(folder / "s.tif", folder / "t.tif"), ElementsAre(HasSubstr("sub-images")));
            continue;
        }
        try {
            readPhotograph(folder / "s.tif");
            ADD_FAILURE() << "read";
        } catch (const PhotographError& error) {
            EXPECT_THAT(error.what(), HasSubstr("s.tif: is a camera's raw file; "));
        }
    }
}

// The first strip stands where one maker's raw files have their mark.
TEST(TiffPages, OfOneGreyAreNoCameraRawFile) {
    const TestFolder folder;
    folder.run("convert -size 16x16 'xc:rgb(73,73,73)' -type TrueColor -depth 8 -compress none s.tif && "
               "head -c 12 s.tif | tail -c 4 | grep -q IIII");
    EXPECT_EQ(readPhotograph(folder / "s.tif").width, 16);
}

TEST(TiffPages, ThatAreAMaskStandForNoPicture) {
    const TestFolder folder;
    writeTiff(folder / "m.tif", "wl", {kPages.back()});
    writeTiff(folder / "two.tif", "wl", {kPages.back(), kPages.front()});
    for (const auto& [source, target] :
         {std::pair("m.tif", "t.tif"), {"m.tif", "t.jpg"}, {"two.tif", "t.png"}}) {
        PhotographReader reader(folder / source);
        const Photograph page = reader.next();
        EXPECT_THROW(checkTarget(page, folder / target, {}), PhotographError) << source << target;
    }
    EXPECT_THAT(rewrite(folder / "two.tif", folder / "t.tif"), IsEmpty());
    std::vector<std::string> lost;
    TiffPage page;
    page.fields = {{TIFFTAG_IMAGEWIDTH, TIFF_SHORT, {9, 0}}, {TIFFTAG_EXIFIFD, TIFF_LONG, Bytes(4)}};
    EXPECT_EQ(copiedFields(page, lost).size(), 1U);
    EXPECT_THAT(lost, ElementsAre("what the tag 0x8769 leads to"));
}

TEST(TiffPages, OfSeparatePlanesKeepTheirColoursAsJpeg) {
    const TestFolder folder;
    folder.run("convert -size 32x32 'xc:rgb(220,60,20)' -depth 8 -interlace plane -compress none s.tif");
    WriteOptions options;
    options.compression = "jpeg";
    writePhotograph(readPhotograph(folder / "s.tif"), folder / "t.tif", options);
    std::uint32_t pixel[32 * 32] = {};
    ASSERT_EQ(TIFFReadRGBAImage(openTiff(folder / "t.tif", "r").get(), 32, 32, pixel, 0), 1);
    EXPECT_NEAR(TIFFGetR(pixel[500]), 220, 3);
    EXPECT_NEAR(TIFFGetG(pixel[500]), 60, 3);
    EXPECT_NEAR(TIFFGetB(pixel[500]), 20, 3);
}

TEST(TiffPages, ThatAreDamagedAreNamed) {
    const TestFolder folder;
    writeTiff(folder / "s.tif", "wl", {kPages[0], kPages[1], kPages[3]});
    folder.run(R"(python3 - <<'END'
import struct
whole = open('s.tif', 'rb').read()
links, pages = [4], []
while at := struct.unpack_from('<I', whole, links[-1])[0]:
    pages.append(at)
    links.append(at + 2 + 12 * struct.unpack_from('<H', whole, at)[0])
def put(name, at, value):
    open(name, 'wb').write(whole[:at] + struct.pack('<I', value) + whole[at + 4:])
put('circle.tif', links[2], pages[0])
put('self.tif', links[3], pages[2])
put('beyond.tif', links[1], len(whole))
open('cut.tif', 'wb').write(whole[:pages[1] + 30])
entries = struct.unpack_from('<H', whole, pages[1])[0]
strips = [e for e in range(pages[1] + 2, links[2], 12) if struct.unpack_from('<H', whole, e)[0] == 273][0]
put('strips.tif', struct.unpack_from('<I', whole, strips + 8)[0], len(whole) - 3)
END
)");
    const std::map<std::string, std::string> causes = {
        {"circle.tif", "page 2 leads back to page 1"},
        {"self.tif", "page 3 leads back to page 3"},
        {"beyond.tif", "page 2: its directory is damaged or cut"},
        {"cut.tif", "page 2: its directory is damaged or cut"},
        {"strips.tif", "page 2: is damaged or cut short"}};
    for (const auto& [name, cause] : causes) {
        try {
            rewrite(folder / name, folder / "t.tif");
            ADD_FAILURE() << name;
        } catch (const PhotographError& error) {
            EXPECT_THAT(error.what(), testing::StartsWith((folder / name).string() + ": ")) << name;
            EXPECT_THAT(error.what(), HasSubstr(cause)) << name;
        }
    }
    EXPECT_EQ(folder.count(), causes.size() + 2); // the source and the log
    // One that is cut while it is read, too.
    PhotographReader reader(folder / "s.tif");
    reader.next();
    fs::resize_file(folder / "s.tif", 100);
    EXPECT_THROW(reader.next(), PhotographError);
    EXPECT_THAT(writePhotograph(readPhotograph(folder / "beyond.tif", {.firstOnly = true}), folder / "t.png"),
                ElementsAre(HasSubstr("the other pages")));
}

// Nobody walks along all pages for each of them: what is read of a file grows as its pages do.
TEST(TiffPages, AreReadOnceEach) {
    const TestFolder folder;
    const Page page = {8, 8, 8, 1, PHOTOMETRIC_MINISBLACK};
    const auto read = [] { // bytes by this process
        std::ifstream file("/proc/self/io");
        std::string name;
        double bytes = 0;
        file >> name >> bytes;
        return bytes;
    };
    std::map<int, double> taken;
    for (const int pages : {10, 50, 250}) {
        writeTiff(folder / "s.tif", "wb", std::vector<Page>(static_cast<std::size_t>(pages), page));
        const double before = read();
        PhotographReader reader(folder / "s.tif");
        for (int i = 0; i < pages; ++i)
            EXPECT_EQ(reader.next().samples[1], (1 + i * 31) % 251);
        taken[pages] = read() - before;
    }
    EXPECT_LT(taken[250] - taken[50], 5.5 * (taken[50] - taken[10]));
}

#if !defined(__SANITIZE_ADDRESS__) && !defined(__SANITIZE_THREAD__) // they keep what is freed
// Eight pages of twelve megabytes take no more than one, but for what the heap keeps of earlier ones.
TEST(TiffPages, TakeTheMemoryOfOne) {
    const TestFolder folder;
    const Page page = {2000, 2000, 8, 3, PHOTOMETRIC_RGB};
    writeTiff(folder / "1.tif", "w", {page});
    writeTiff(folder / "8.tif", "w", std::vector<Page>(8, page));
    std::map<std::string, long> peak; // in kilobytes
    for (const char* name : {"1.tif", "8.tif"}) {
        const fs::path source = folder / name;
        const pid_t child = ::fork();
        if (child == 0) {
            ::execl(ORVELA_PROGRAM, "orvela", "enhance", "--quiet", "--mode", "AutoContrast", source.c_str(),
                    nullptr);
            ::_exit(1);
        }
        int status = -1;
        rusage used{};
        ::wait4(child, &status, 0, &used);
        ASSERT_EQ(status, 0);
        peak[name] = used.ru_maxrss;
    }
    EXPECT_LT(peak["8.tif"], peak["1.tif"] * 3 / 2);
}
#endif

} // namespace
