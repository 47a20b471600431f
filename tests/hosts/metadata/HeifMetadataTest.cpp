// What phones and other programs leave in HEIF files beside picture, Exif and XMP.

#include "hosts/ChangedFiles.h"
#include "metadata/MetadataReader.h"

#include <gmock/gmock.h>

using namespace orvela;

namespace {

using testing::ElementsAre;
using testing::EndsWith;
using testing::IsEmpty;

constexpr char kSmall[] = "convert $S/coffee.png -resize 64x48! -strip p.png && vips heifsave p.png s.heic ";

TEST(HeifMetadata, NamesBoxesBehindThePicture) {
    const TestFolder folder;
    folder.run(kSmall);
    const std::string plain = folder.text("s.heic");
    const auto film = [](const std::string& handler) {
        const auto box = [](const std::string& type, const std::string& content) {
            return std::string("\0\0\0", 3) + static_cast<char>(8 + content.size()) + type + content;
        };
        return box("moov", box("trak", box("mdia", box("hdlr", std::string(8, '\0') + handler))));
    };
    const auto named = [&](const std::string& behind) {
        const std::string file = plain + behind;
        return readMetadata(asBytes(file), FileFormat::Heif).unheld;
    };
    using std::string_literals::operator""s;
    EXPECT_THAT(named(""), IsEmpty());
    EXPECT_THAT(named("\0\0\0\x0C"s + "mpvdfilm"), ElementsAre("the film beside the picture"));
    EXPECT_THAT(named(film("vide")), ElementsAre("the film beside the picture"));
    EXPECT_THAT(named(film("pict")), IsEmpty()); // of which the reader of the picture tells
    EXPECT_THAT(named("\0\0\0\x0C"s + "abcdabcd"), ElementsAre("the HEIF box abcd"));
    EXPECT_THAT(named("\0\0\0\x10"s + "ftypisom\0\0\0\0"s + film("vide")),
                ElementsAre("the film behind the picture"));
    EXPECT_THAT(named("no box at all"), ElementsAre("13 bytes behind the picture"));
    EXPECT_THAT(named(std::string(16, '\0')), IsEmpty());
    EXPECT_THAT(named("\0\0\1\0mdatof the picture"s), IsEmpty()); // cut short
    EXPECT_THAT(named("\0\0\0\x10moov\0\0\0\x50trak"s), ElementsAre("the film beside the picture"));
    folder.put("s.heic", plain + "\0\0\0\x0C"s + "mpvdfilm");
    EXPECT_THAT(convert(folder, "s.heic", "t.jpg"),
                ElementsAre(EndsWith("hold: the film beside the picture")));
    EXPECT_THAT(convert(folder, "t.jpg", "t.heic"), IsEmpty());
}

// The reference that says what the item describes is taken away.
TEST(HeifMetadata, NamesItemsThatBelongToNothing) {
    const TestFolder folder;
    folder.run(std::string(kSmall) +
               "&& convert p.png p.jpg && exiftool -q -overwrite_original -ISO=200 p.jpg && "
               "vips heifsave p.jpg s.heic");
    EXPECT_THAT(readPhotograph(folder / "s.heic").metadata->unheld, IsEmpty());
    folder.run("sed -i 's/cdsc/cdsX/' s.heic");
    EXPECT_THAT(convert(folder, "s.heic", "t.jpg"),
                ElementsAre(EndsWith("cannot hold: a HEIF item of the kind Exif")));
}

} // namespace
