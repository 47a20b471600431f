#include "files/PhotographReader.h"

#include "hosts/TestFiles.h"

#include <gmock/gmock.h>
#include <sys/wait.h>

using namespace orvela;
using testing::ElementsAre;
using testing::HasSubstr;

namespace {

std::string refusal(const std::filesystem::path& path) {
    try {
        readPhotograph(path);
    } catch (const PhotographError& error) {
        return error.what();
    }
    return "read";
}

TEST(PhotographReader, RefusesEachBadFileByNameCauseAndAdvice) {
    const TestFolder folder;
    folder.run(
        "convert $S/coffee.png -resize 200x p.png && vips copy p.png lzw.tif[compression=lzw] && "
        "convert p.png whole.jpg && convert p.png -interlace JPEG prog.jpg && vips copy p.png whole.webp && "
        "vips heifsave p.png whole.heic && convert p.png -compress RLE whole.psd");
    for (const std::vector<std::string>& row : tableRows("bad_files.txt")) {
        folder.run(row.at(2));
        const std::string text = refusal(folder / row[0]);
        EXPECT_THAT(text, testing::StartsWith((folder / row[0]).string() + ": "));
        EXPECT_THAT(text, testing::HasSubstr(row[1])) << row[2];
        EXPECT_THAT(text, testing::HasSubstr("; "));
        EXPECT_THAT(text, testing::Not(testing::HasSubstr("\n")));
    }
}

TEST(PhotographReader, NamesMissingPermission) {
    const TestFolder folder;
    folder.run("chmod 755 . && cp $S/rocket.jpg a.jpg && chmod 0 a.jpg");
    const pid_t child = ::fork();
    if (child == 0) {
        const bool changed = ::getuid() != 0 || ::setuid(65534) == 0;
        const std::string text = refusal(folder / "a.jpg");
        ::_exit(changed && text.find("no permission") != std::string::npos ? 0 : 1);
    }
    int status = -1;
    ::waitpid(child, &status, 0);
    EXPECT_EQ(status, 0);
}

TEST(PhotographReader, ReadsBitmapsAsGreyAndTheFirstPageOfSeveral) {
    const TestFolder folder;
    folder.run("convert -size 9x2 xc:white -fill black -draw 'point 8,1' -monochrome -compress None m.png && "
               "convert m.png -compress Group4 m.tif && "
               "convert m.png -negate -depth 1 GRAY:rows && python3 -c \"open('m.psd', 'wb').write("
               "b'8BPS\\0\\1' + bytes(7) + b'\\1' + bytes([0, 0, 0, 2, 0, 0, 0, 9, 0, 1]) + bytes(16) + "
               "open('rows', 'rb').read())\" && "
               "convert $S/coffee.png -resize 5x3! $S/rocket.jpg pages.tif");
    for (const char* name : {"m.png", "m.tif", "m.psd"}) {
        const Photograph read = readPhotograph(folder / name);
        std::vector<std::uint8_t> expected(18, 255);
        expected[17] = 0;
        EXPECT_THAT(read.notes, ElementsAre(HasSubstr("expanded"))) << name; // they have one bit
        EXPECT_EQ(read.model, ColorModel::Grey) << name;
        EXPECT_EQ(read.samples, expected) << name;
    }
    const Photograph first = readPhotograph(folder / "pages.tif");
    EXPECT_EQ(first.pages, 2);
    EXPECT_EQ(first.width, 5);
    EXPECT_EQ(first.height, 3);
}

// The first brand is a matter of who wrote the file; each that a reader may go by as well counts.
TEST(PhotographReader, KnowsHeifByAnyOfItsBrands) {
    const TestFolder folder;
    folder.run("convert $S/coffee.png -resize 64x48! p.png && vips heifsave p.png heic && "
               "vips heifsave p.png avif.avif --compression av1 --effort 0 && mv avif.avif avif");
    for (const char* kind : {"heic", "avif"}) {
        const std::string whole = folder.text(kind);
        for (const char* first : {"miaf", "mif1", "msf1", "isom"}) {
            folder.put("s.bin", std::string(whole).replace(8, 4, first));
            EXPECT_EQ(readPhotograph(folder / "s.bin").width, 64) << kind << first;
        }
        const std::size_t end = static_cast<unsigned char>(whole[3]);
        std::string film = std::string(whole).replace(8, 4, "isom");
        for (std::size_t at = 16; at < end; at += 4)
            film.replace(at, 4, "mp41");
        folder.put("s.bin", film);
        EXPECT_THAT(refusal(folder / "s.bin"), testing::HasSubstr("is not a picture of a known kind"));
    }
}

// 10 bits of HEIF reach full scale.
TEST(PhotographReader, TellsTheEncoding) {
    const TestFolder folder;
    folder.run(
        "vips black b.v 64 64 --bands 3 && "
        "vips linear b.v w.v 1 65535 && vips cast w.v w.png ushort && vips heifsave w.png w.heic --bitdepth "
        "10 --Q 100 && "
        "convert $S/rocket.jpg -units PixelsPerInch -density 300x150 d.jpg");
    const Photograph dense = readPhotograph(folder / "d.jpg");
    EXPECT_NEAR(dense.xResolution, 300 / 25.4, 1e-6);
    EXPECT_NEAR(dense.yResolution, 150 / 25.4, 1e-6);
    const Photograph white = readPhotograph(folder / "w.heic");
    EXPECT_EQ(white.encoding.bitDepth, 10);
    const auto sample = static_cast<unsigned>(white.samples[0] + 256 * white.samples[1]);
    EXPECT_GT(sample, 0xFF00U);
    EXPECT_EQ(sample & 63U, sample >> 10); // the high bits again below the ten
}

} // namespace
