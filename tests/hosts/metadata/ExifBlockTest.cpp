#include "metadata/ExifBlock.h"

#include "hosts/TestFiles.h"
#include "metadata/JpegMetadata.h"
#include "metadata/NotePreviews.h"

#include <gmock/gmock.h>

#include <random>

using namespace orvela;

namespace {

Bytes cameraFile(const std::string& name) {
    std::ifstream file(ORVELA_PHOTOS "/camera/" + name, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
}

Bytes cameraBlock(const std::string& name) {
    return readJpegMetadata(cameraFile(name)).exif;
}

// A frame of that size is all that counts here.
Bytes jpegOf(int width, int height, std::size_t size) {
    Bytes jpeg = {0xFF, 0xD8, 0xFF, 0xC0, 0, 8, 8};
    append(jpeg, static_cast<std::uint64_t>(height), 2, ByteOrder::Big);
    append(jpeg, static_cast<std::uint64_t>(width), 2, ByteOrder::Big);
    jpeg.resize(std::max(size, jpeg.size()), 0xAA);
    return jpeg;
}

// Little-endian; a directory of pointers and numbers: tag, type, value.
void addDirectory(Bytes& block, const std::vector<std::array<std::uint32_t, 3>>& entries,
                  std::uint32_t next) {
    append(block, entries.size(), 2, ByteOrder::Little);
    for (const auto& [tag, type, value] : entries) {
        append(block, tag, 2, ByteOrder::Little);
        append(block, type, 2, ByteOrder::Little);
        append(block, 1, 4, ByteOrder::Little);
        append(block, value, 4, ByteOrder::Little);
    }
    append(block, next, 4, ByteOrder::Little);
}

Bytes header() {
    return {'I', 'I', 42, 0, 8, 0, 0, 0};
}

// Turned 6; edges 9 and 7; at 26 the Exif directory, at 56 that of a thumbnail of 20 bytes at 86.
Bytes smallBlock() {
    Bytes block = header();
    addDirectory(block, {{tiff::Orientation, tiff::Short, 6}, {tiff::ExifIfd, tiff::Long, 38}}, 68);
    addDirectory(block, {{tiff::PixelXDimension, tiff::Short, 9}, {tiff::PixelYDimension, tiff::Long, 7}}, 0);
    addDirectory(block, {{tiff::JpegOffset, tiff::Long, 98}, {tiff::JpegLength, tiff::Long, 20}}, 0);
    append(block, jpegOf(4, 3, 20));
    append(block, "behind");
    return block;
}

std::vector<std::size_t> changedPlaces(const Bytes& before, const Bytes& after) {
    std::vector<std::size_t> places;
    for (std::size_t i = 0; i < std::min(before.size(), after.size()); ++i)
        if (before[i] != after[i])
            places.push_back(i);
    return places;
}

TEST(ExifBlock, ChangesOnlyTheBytesThatItIsAskedFor) {
    ExifBlock block(smallBlock());
    EXPECT_FALSE(block.isDamaged());
    EXPECT_EQ(block.orientation(), 6);
    block.makeUpright();
    EXPECT_EQ(block.orientation(), 1);
    block.setDimensions(300, 70000);
    EXPECT_THAT(changedPlaces(smallBlock(), block.bytes()),
                testing::ElementsAre(18, 48, 49, 60, 61, 62)); // 6 -> 1, 9 -> 300, 7 -> 70000
    EXPECT_EQ(block.bytes().size(), smallBlock().size());
}

TEST(ExifBlock, MakesThumbnailsAnewWhereTheOldOnesStood) {
    std::vector<std::string> asked;
    const ThumbnailMaker maker = [&](int width, int height, int quality) {
        asked.push_back(std::to_string(width) + "x" + std::to_string(height));
        return jpegOf(width, height, quality > 60 ? 21 : 15);
    };
    ExifBlock block(smallBlock());
    EXPECT_TRUE(block.renewThumbnails(maker, false));
    EXPECT_GT(asked.size(), 1U); // until it fits
    EXPECT_THAT(asked, testing::Each("4x3"));
    Bytes expected = smallBlock();
    expected[90] = 15; // the length
    std::fill(expected.begin() + 98, expected.begin() + 118, 0);
    const Bytes jpeg = jpegOf(4, 3, 15);
    std::copy(jpeg.begin(), jpeg.end(), expected.begin() + 98);
    EXPECT_EQ(block.bytes(), expected);

    ExifBlock turned(smallBlock());
    asked.clear();
    EXPECT_TRUE(turned.renewThumbnails(maker, true));
    EXPECT_THAT(asked, testing::Each("3x4"));
}

TEST(ExifBlock, DropsThumbnailsThatDoNotFitOrCannotBeRead) {
    const ThumbnailMaker large = [](int width, int height, int) { return jpegOf(width, height, 21); };
    const auto dropped = [&](const Bytes& before) {
        ExifBlock block(before);
        EXPECT_FALSE(block.renewThumbnails(large, false));
        EXPECT_EQ(number(block.bytes(), 34, 4, ByteOrder::Little), 0U); // the link
        EXPECT_TRUE(ExifBlock(block.bytes()).renewThumbnails(large, false));
        return block.bytes();
    };
    const Bytes cleared = dropped(smallBlock());
    EXPECT_THAT(ByteView(cleared).subspan(98, 20), testing::Each(0));
    EXPECT_EQ(asText(ByteView(cleared).subspan(118)), "behind");
    Bytes last = smallBlock();
    last.resize(118);
    EXPECT_EQ(dropped(last).size(), 98U); // nothing stands behind it
    Bytes huge = smallBlock();
    huge[105] = 0xFF; // 65283 pixels high
    dropped(huge);
    // Of two none is left.
    Bytes two = smallBlock();
    store(two, 94, two.size(), 4, ByteOrder::Little); // the link behind the first
    addDirectory(two, {{tiff::JpegOffset, tiff::Long, 154}, {tiff::JpegLength, tiff::Long, 15}}, 0);
    append(two, jpegOf(4, 3, 15));
    const ThumbnailMaker none = [](int, int, int) { return Bytes(); };
    ExifBlock both(two);
    EXPECT_FALSE(both.renewThumbnails(none, false));
    EXPECT_EQ(number(both.bytes(), 34, 4, ByteOrder::Little), 0U);
    // One that stands where the directory does is not written over.
    Bytes shared = smallBlock();
    shared[78] = 0;
    EXPECT_EQ(dropped(shared).size(), shared.size());
}

// At 8 the first directory, at 38 Exif's with the note at 68: its tag, a preview of 30 bytes, its end; behind
// it a preview of 40 bytes that the note refers to. Another tag holds a JPEG too.
TEST(ExifBlock, MakesPreviewsOfMakerNotesAnew) {
    const auto preview = [](int width, std::size_t size) {
        Bytes jpeg = jpegOf(width, 3, size - 6);
        append(jpeg, 0xFFDA0002FFD9, 6, ByteOrder::Big);
        return jpeg;
    };
    Bytes block = header();
    addDirectory(block, {{0xC000, tiff::Undefined, 148}, {tiff::ExifIfd, tiff::Long, 38}}, 0);
    store(block, 14, 30, 4, ByteOrder::Little);
    addDirectory(block, {{tiff::MakerNote, tiff::Undefined, 68}}, 0);
    store(block, 44, 40, 4, ByteOrder::Little);
    block.resize(68);
    append(block, "NOTE ");
    append(block, preview(4, 30));
    append(block, " END ");
    append(block, preview(8, 40));
    append(block, preview(4, 30));
    const ThumbnailMaker maker = [](int width, int height, int) {
        return Bytes(20, static_cast<std::uint8_t>(width * 16 + height));
    };
    const auto at = [](const Bytes& bytes, std::size_t from, std::size_t size) {
        return copyOf(ByteView(bytes).subspan(from, size));
    };
    Bytes renewed = block;
    EXPECT_TRUE(renewNotePreviews(renewed, maker, false));
    Bytes expected = block;
    std::fill_n(expected.begin() + 73, 30, 0);
    std::fill_n(expected.begin() + 73, 20, 0x43);
    std::fill_n(expected.begin() + 108, 40, 0);
    std::fill_n(expected.begin() + 108, 20, 0x83);
    EXPECT_EQ(renewed, expected);
    const ThumbnailMaker large = [](int, int, int) { return Bytes(31, 1); };
    renewed = block;
    EXPECT_FALSE(renewNotePreviews(renewed, large, true));
    EXPECT_THAT(at(renewed, 73, 30), testing::Each(0));
    EXPECT_THAT(at(renewed, 108, 31), testing::Each(1));
    EXPECT_EQ(at(renewed, 148, 30), at(block, 148, 30));
}

TEST(ExifBlock, AddsTagsWithoutMovingAnything) {
    const Bytes before = cameraBlock("canon-eos-300d.jpg");
    ExifBlock block(before);
    block.add({{tiff::Artist, tiff::Ascii, 6, copyOf(asBytes(std::string_view("A. B.\0", 6)))}});
    EXPECT_EQ(block.text(tiff::Artist), "A. B.");
    EXPECT_EQ(block.text(0x010F), "Canon");
    EXPECT_THAT(changedPlaces(before, block.bytes()), testing::Each(testing::Lt(8))); // the header's link
    block.setDensity({{300, 1}, {11811, 1}, DensityUnit::Metre});
    const Density density = block.density().value();
    EXPECT_EQ(density.unit, DensityUnit::Centimetre);
    EXPECT_DOUBLE_EQ(density.y.value(), 118.11);
    ExifBlock fresh({});
    fresh.setDensity({{72, 1}, {72, 1}, DensityUnit::Inch});
    EXPECT_EQ(fresh.density()->x, (Rational{72, 1}));
    EXPECT_FALSE(ExifBlock(fresh.bytes()).isDamaged());
}

TEST(ExifBlock, LeavesDamagedBlocksAlone) {
    Bytes circle = header();
    addDirectory(circle, {{tiff::ExifIfd, tiff::Long, 8}}, 8);
    Bytes outside = header();
    addDirectory(outside, {{tiff::ExifIfd, tiff::Long, 0xFFFFFFF0}}, 0x7FFFFFFF);
    Bytes length = header();
    append(length, 0xFFFF, 2, ByteOrder::Little);
    const Bytes noBlock = {'X', 'X', 0, 0, 0, 0, 0, 0, 0, 0};
    for (const Bytes& bytes : {circle, outside, length, noBlock, header(), Bytes{'I', 'I'}}) {
        ExifBlock block(bytes);
        EXPECT_TRUE(block.isDamaged());
        block.setDimensions(1, 2);
        block.makeUpright();
        block.add({{tiff::Artist, tiff::Ascii, 2, {'A', 0}}});
        block.dropThumbnails();
        EXPECT_EQ(block.bytes(), bytes);
    }
}

// Whatever its bytes are, a block can be asked for anything.
TEST(ExifBlock, SurvivesMutations) {
    std::mt19937 random(1);
    const ThumbnailMaker maker = [](int width, int height, int) { return jpegOf(width, height, 100); };
    for (const char* name : {"canon-eos-300d.jpg", "nikon-e950.jpg", "nikon-d70.jpg"}) {
        const Bytes whole = cameraBlock(name);
        for (int run = 0; run < 1500; ++run) {
            Bytes mutant = whole;
            for (int i = 0; i < 4; ++i)
                mutant[random() % (i < 3 ? 400 : mutant.size())] = static_cast<std::uint8_t>(random());
            if (run % 3 == 0)
                mutant.resize(random() % mutant.size());
            ExifBlock block(mutant);
            block.setDimensions(4, 3);
            block.makeUpright();
            block.renewThumbnails(maker, false);
            block.setDensity({{72, 1}, {72, 1}, DensityUnit::Inch});
            block.density();
            block.dropThumbnails();
            EXPECT_LE(block.bytes().size(), whole.size() + 2048);
        }
    }
}

} // namespace
