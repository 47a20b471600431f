#include "files/PhotographReader.h"
#include "files/PhotographWriter.h"
#include "hosts/TestFiles.h"

#include <gmock/gmock.h>

using namespace orvela;

namespace {

using testing::ElementsAre;
using testing::HasSubstr;

TEST(Metadata, KeepsAMakerNoteAndMendsTheDimensions) {
    const TestFolder folder;
    folder.run(
        "cp $S/rocket.jpg s.jpg && exiv2 -M'set Exif.Image.Make Canon' -M'set Exif.Photo.PixelXDimension 9' "
        "-M'set Exif.Canon.OwnerName A. Person' -M'set Exif.CanonCs.Quality 3' mo s.jpg && "
        "exiftool -q -overwrite_original -Comment='A comment' s.jpg");
    for (const char* name : {"t.jpg", "t.tif", "t.png"}) {
        EXPECT_THAT(writePhotograph(readPhotograph(folder / "s.jpg"), folder / name),
                    testing::SizeIs(std::string(name) == "t.tif"));
        const std::string tags =
            folder.output(std::string("exiftool -s -OwnerName -Quality -ExifImageWidth ") + name);
        EXPECT_THAT(tags, HasSubstr(": A. Person")) << name;
        EXPECT_THAT(tags, HasSubstr(": Fine")) << name;
        EXPECT_THAT(tags, HasSubstr(": 640")) << name;
    }
    EXPECT_THAT(folder.output("exiftool -Comment t.jpg"), HasSubstr("A comment"));
}

TEST(Metadata, WarnsOfMalformedXmpAndOfWhatAFormatCannotHold) {
    const TestFolder folder;
    folder.run("cp $S/rocket.jpg s.jpg && exiftool -q -overwrite_original -XMP:Title=zzzz s.jpg && sed -i "
               "'s,</rdf:Alt>,</rdf:Axt>,' s.jpg && "
               "cp $S/rocket.jpg k.jpg && exiftool -q -overwrite_original -IPTC:Keywords=night k.jpg");
    const Photograph malformed = readPhotograph(folder / "s.jpg");
    EXPECT_THAT(writePhotograph(malformed, folder / "t.jpg"),
                ElementsAre(HasSubstr("s.jpg: damaged, carried over as far as possible: the XMP data")));
    EXPECT_THAT(writePhotograph(malformed, folder / "t.tif"), testing::Contains(HasSubstr("the XMP data")));
    for (const char* name : {"t.jpg", "t.tif"})
        EXPECT_THAT(folder.text(name), HasSubstr("</rdf:Axt>"));
    EXPECT_THAT(writePhotograph(readPhotograph(folder / "k.jpg"), folder / "t.webp"),
                ElementsAre(HasSubstr("the WebP file cannot hold: the comment; IPTC Keywords")));
}

TEST(Metadata, TravelsWithThePictureWhateverBecomesOfItsFile) {
    const TestFolder folder;
    folder.run("convert $S/coffee.png -resize 64x48! s.jpg && exiftool -q -overwrite_original -ISO=200 "
               "-Make=Canon -IPTC:Keywords=night -XMP:Title=T s.jpg && vips heifsave s.jpg s.heic && "
               "convert s.jpg s.tif && exiftool -q -overwrite_original -TagsFromFile s.jpg s.tif && "
               "convert $S/coffee.png -resize 9x9! other.png");
    for (const char* name : {"s.jpg", "s.tif", "s.heic"}) {
        const Photograph photograph = readPhotograph(folder / name);
        writePhotograph(photograph, folder / "before.jpg");
        folder.run(std::string("cp other.png ") + name);
        writePhotograph(photograph, folder / "changed.jpg");
        folder.run(std::string("rm ") + name);
        writePhotograph(photograph, folder / "gone.jpg");
        EXPECT_EQ(folder.output("exiftool -s3 -ISO -Make -Title before.jpg"), "200\nCanon\nT\n") << name;
        folder.run(
            "cmp before.jpg changed.jpg && cmp before.jpg gone.jpg && rm before.jpg changed.jpg gone.jpg");
    }
}

TEST(Metadata, KeepsDamagedExifAsItStands) {
    const TestFolder folder;
    folder.run("(head -c 2 $S/rocket.jpg; printf '\\377\\341\\0\\020Exif\\0\\0II*\\0\\377\\377\\377\\177'; "
               "tail -c +3 $S/rocket.jpg) > s.jpg");
    const Photograph photograph = readPhotograph(folder / "s.jpg");
    EXPECT_THAT(writePhotograph(photograph, folder / "t.jpg"), ElementsAre(HasSubstr("s.jpg: damaged")));
    EXPECT_EQ(readPhotograph(folder / "t.jpg").metadata->exif, photograph.metadata->exif);
    EXPECT_THAT(writePhotograph(photograph, folder / "t.tif"),
                testing::Contains(HasSubstr("the TIFF file cannot hold: the comment; the Exif data")));
    EXPECT_EQ(readPhotograph(folder / "t.tif").width, photograph.width);
}

// Decoding a HEIF turns the pixels, so the tag must not turn them a second time.
TEST(Metadata, IsUprightAfterHeif) {
    const TestFolder folder;
    folder.run("convert $S/coffee.png -resize 64x48! p.jpg && exiftool -q -overwrite_original "
               "-Orientation#=6 -ISO=200 "
               "-XMP-tiff:Orientation#=6 -XMP:Title=T p.jpg && vips heifsave p.jpg s.heic");
    const Photograph photograph = readPhotograph(folder / "s.heic");
    for (const char* name : {"t.jpg", "t.heic"}) {
        EXPECT_THAT(writePhotograph(photograph, folder / name), testing::IsEmpty());
        const std::string tags =
            folder.output(std::string("exiftool -a -n -s3 -Orientation -ISO -Title ") + name);
        EXPECT_EQ(tags, "1\n1\n200\nT\n") << name;
    }
}

} // namespace
