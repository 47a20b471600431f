#include "files/ChildProcess.h"
#include "files/HeifBoxes.h"
#include "files/HeifEncoder.h"
#include "files/HeifRate.h"
#include "files/PhotographReader.h"
#include "files/PhotographWriter.h"
#include "hosts/TestFiles.h"
#include "hosts/TestPhotograph.h"

#include <gmock/gmock.h>
#include <libheif/heif.h>

#include <cmath>
#include <csignal>
#include <new>
#include <thread>

using namespace orvela;

namespace {

using testing::ElementsAre;
using testing::EndsWith;
using testing::HasSubstr;

WriteOptions overwriting() {
    WriteOptions options;
    options.overwrite = true;
    return options;
}

HeifCoding codingOf(const TestFolder& folder, const std::string& name) {
    const std::string text = folder.text(name);
    return heifCoding(Bytes(text.begin(), text.end())).value();
}

TEST(HeifFile, KeepsTheResolutionOfColour) {
    const TestFolder folder;
    folder.run("convert $S/coffee.png -resize 128x96! p.png && vips heifsave p.png full.heic "
               "--subsample-mode off && "
               "vips heifsave p.png half.heic --subsample-mode on && "
               "vips heifsave p.png full.avif --subsample-mode off --compression av1");
    for (const char* name : {"full.heic", "half.heic", "full.avif"}) {
        const Photograph photograph = readPhotograph(folder / name);
        writePhotograph(photograph, folder / ("new-" + std::string(name)));
        EXPECT_EQ(codingOf(folder, "new-" + std::string(name)).chroma, photograph.encoding.chroma) << name;
        EXPECT_EQ(photograph.encoding.chroma, *name == 'f' ? Chroma::Full : Chroma::Half);
    }
    Photograph photograph = readPhotograph(folder / "full.heic");
    photograph.encoding.chroma = Chroma::HalfWidth;
    writePhotograph(photograph, folder / "wide.heic");
    EXPECT_EQ(readPhotograph(folder / "wide.heic").encoding.chroma, Chroma::HalfWidth);
    EXPECT_THAT(folder.output("exiftool -a -ee -G -ChromaFormat wide.heic"), HasSubstr("4:2:2"));
    WriteOptions half;
    half.chromaSubsampled = true;
    writePhotograph(photograph, folder / "asked.heic", half);
    EXPECT_EQ(codingOf(folder, "asked.heic").chroma, Chroma::Half);
}

// Only a given quality makes it lossy. A lossy one does not become lossless, however good it is.
TEST(HeifFile, StaysWithoutLoss) {
    const TestFolder folder;
    folder.run("convert $S/coffee.png -resize 128x96! p.png && vips heifsave p.png l.heic --lossless "
               "--subsample-mode off && vips heifsave p.png q.heic --Q 100");
    const Photograph photograph = readPhotograph(folder / "l.heic");
    for (const char* target : {"t.heic", "t.avif"}) {
        writePhotograph(photograph, folder / target);
        const Photograph read = readPhotograph(folder / target);
        ASSERT_EQ(read.samples.size(), photograph.samples.size());
        int most = 0; // rounding between the models of colour
        for (std::size_t i = 0; i < read.samples.size(); ++i)
            most = std::max(most, std::abs(read.samples[i] - photograph.samples[i]));
        EXPECT_LE(most, 2) << target;
    }
    EXPECT_TRUE(codingOf(folder, "t.heic").lossless);
    WriteOptions lossy = overwriting();
    lossy.quality = 80;
    writePhotograph(photograph, folder / "t.heic", lossy);
    EXPECT_FALSE(codingOf(folder, "t.heic").lossless);
    writePhotograph(readPhotograph(folder / "q.heic"), folder / "u.heic");
    EXPECT_FALSE(codingOf(folder, "u.heic").lossless);
}

// The same pixels written once more take about as many bytes, whatever the quality was.
TEST(HeifFile, TakesAsManyBytesAsTheSource) {
    const TestFolder folder;
    folder.run("convert $S/rocket.jpg -resize 384x256! p.png");
    for (const char* quality : {"35", "60", "85"}) {
        folder.run(std::string("vips heifsave p.png s.heic --Q ") + quality);
        writePhotograph(readPhotograph(folder / "s.heic"), folder / "t.heic", overwriting());
        const double growth = static_cast<double>(codingOf(folder, "t.heic").bytes) /
                              static_cast<double>(codingOf(folder, "s.heic").bytes);
        EXPECT_GT(growth, 0.8) << quality;
        EXPECT_LT(growth, 1.25) << quality;
    }
}

// Of a picture that was coded before too, whose bytes rise little in between.
TEST(HeifFile, FindsTheQualityOfASize) {
    const auto even = [](int quality) { return std::exp(0.07 * quality - 4); };
    const auto coded = [&](int quality) {
        return even(quality) * std::exp(-0.05 * std::clamp(quality - 40, 0, 20));
    };
    int calls = 0;
    for (const int quality : {25, 33, 42, 52, 60, 77, 95}) {
        EXPECT_NEAR(matchingQuality(even(quality), even), quality, 1);
        const int found = matchingQuality(coded(quality), [&](int q) { return ++calls, coded(q); });
        EXPECT_NEAR(coded(found) / coded(quality), 1, 0.1) << quality << " " << found;
    }
    EXPECT_LE(calls, 5 * 7);
    EXPECT_EQ(matchingQuality(1e-9, even), kLowestHeifQuality);
    EXPECT_EQ(matchingQuality(1e9, even), kHighestHeifQuality);
}

// One block of 64 from the middle of each of 12 x 12 parts, where the coding has one: the parts are 341 rows
// high, their blocks begin at 138, 479, ... 3889, rounded down.
TEST(HeifFile, SamplesThePictureInBlocks) {
    const Photograph photograph =
        testPhotograph(ColorModel::Rgb, 8, 768, 4096, [](std::size_t i) { return i / 3 / 768 % 251; });
    const Photograph sample = heifSample(photograph);
    EXPECT_EQ(sample.width, 768);
    EXPECT_EQ(sample.height, 768);
    EXPECT_EQ(sample.samples[0], 128 % 251);
    EXPECT_EQ(sample.samples[std::size_t{3} * 768 * 64], 448 % 251);
    EXPECT_EQ(sample.samples.back(), (3840 + 63) % 251);
}

// Readers turn a HEIF by properties of its own and leave Exif's orientation alone.
TEST(HeifFile, IsTurnedAsItsSourceIs) {
    const TestFolder folder;
    folder.run("convert $S/coffee.png -resize 61x48! s.png");
    const auto difference = [&](const char* turned) {
        return std::stod(folder.output(std::string("compare -metric MAE up.png ") + turned +
                                       " null: 2>&1 | sed 's/ .*//'")) /
               257;
    };
    for (int orientation = 1; orientation <= 8; ++orientation) {
        folder.run("convert s.png -quality 95 s.jpg && exiftool -q -overwrite_original -Orientation#=" +
                   std::to_string(orientation) + " s.jpg && convert s.jpg -auto-orient up.png");
        EXPECT_THAT(writePhotograph(readPhotograph(folder / "s.jpg"), folder / "t.heic", overwriting()),
                    testing::IsEmpty());
        EXPECT_EQ(folder.output("exiftool -n -s3 -Orientation t.heic"), std::to_string(orientation) + "\n");
        folder.run("convert t.heic t.png");
        EXPECT_LT(difference("t.png"), 8) << orientation;
        writePhotograph(readPhotograph(folder / "t.heic"), folder / "back.png", overwriting());
        EXPECT_LT(difference("back.png"), 8) << orientation;
        EXPECT_EQ(folder.output("exiftool -n -s3 -Orientation back.png"), "1\n");
    }
}

TEST(HeifFile, IsCodedAsItsExtensionSays) {
    const TestFolder folder;
    const Photograph plain = testPhotograph(ColorModel::Rgb, 8, 64, 64, [](std::size_t i) { return i; });
    const std::pair<const char*, bool> steps[] = {{"a.AVIF", true}, {"b.heif", true}, {"c.heic", false}};
    Photograph photograph = plain;
    for (const auto& [name, isAv1] : steps) {
        writePhotograph(photograph, folder / name);
        EXPECT_EQ(codingOf(folder, name).isAv1, isAv1) << name;
        photograph = readPhotograph(folder / name);
    }
    writePhotograph(plain, folder / "d.hif");
    EXPECT_FALSE(codingOf(folder, "d.hif").isAv1);
}

// BT.2020 primaries with the curve of PQ, in the place of what the library writes.
constexpr char kCodes[] = "vips heifsave p.png p.avif --compression av1 && python3 -c \"b = open('p.avif', "
                          "'rb').read(); i = b.index(b'nclx') + 4; open('s.avif', 'wb').write(b[:i] + "
                          "bytes([0, 9, 0, 16]) + b[i + 4:])\"";

TEST(HeifFile, KeepsTheCodeOfItsColours) {
    const TestFolder folder;
    folder.run(std::string("convert $S/coffee.png -resize 128x96! -strip p.png && ") + kCodes);
    const ColorCodes wanted{9, 16};
    WriteOptions fine;
    fine.quality = 95;
    for (const char* name : {"t.avif", "t.heic", "t.png"}) {
        EXPECT_THAT(writePhotograph(readPhotograph(folder / "s.avif"), folder / name, fine),
                    testing::IsEmpty());
        const Photograph result = readPhotograph(folder / name);
        ASSERT_TRUE(result.metadata->colors) << name;
        EXPECT_TRUE(result.metadata->colors->looksLike(wanted)) << name;
    }
    EXPECT_THAT(writePhotograph(readPhotograph(folder / "t.png"), folder / "u.avif"), testing::IsEmpty());
    EXPECT_TRUE(readPhotograph(folder / "u.avif").metadata->colors->looksLike(wanted));
    // Numbers that nobody knows, between 22 and 255, do not hinder the picture.
    Photograph odd = readPhotograph(folder / "t.png");
    Metadata unknown;
    unknown.colors = ColorCodes{200, 16};
    odd.metadata = std::make_shared<const Metadata>(unknown);
    EXPECT_THAT(writePhotograph(odd, folder / "odd.heic"), ElementsAre(HasSubstr("the code of its colours")));
    EXPECT_THAT(writePhotograph(readPhotograph(folder / "s.avif"), folder / "t.jpg"),
                ElementsAre(HasSubstr("the code of its colours (primaries 9, transfer 16)")));
    EXPECT_THAT(writePhotograph(readPhotograph(folder / "p.avif"), folder / "p.jpg"), testing::IsEmpty());
    // The samples mean the same.
    folder.run("convert s.avif s.png && convert t.heic t2.png");
    EXPECT_LT(std::stod(folder.output("compare -metric MAE s.png t2.png null: 2>&1 | sed 's/ .*//'")) / 257,
              3);
}

// Colours of 100 under a transparency of a quarter were 25 in the file.
TEST(HeifFile, TakesAMultipliedTransparencyOutOfColours) {
    const TestFolder folder;
    heif_image* image = nullptr;
    heif_image_create(64, 64, heif_colorspace_RGB, heif_chroma_interleaved_RGBA, &image);
    heif_image_add_plane(image, heif_channel_interleaved, 64, 64, 8);
    int stride = 0;
    std::uint8_t* plane = heif_image_get_plane(image, heif_channel_interleaved, &stride);
    for (int i = 0; i < 64 * stride; ++i)
        plane[i] = i % 4 == 3 ? 64 : 25;
    heif_image_set_premultiplied_alpha(image, 1);
    heif_context* context = heif_context_alloc();
    heif_encoder* encoder = nullptr;
    heif_context_get_encoder_for_format(context, heif_compression_HEVC, &encoder);
    heif_encoder_set_lossy_quality(encoder, 95);
    heif_context_encode_image(context, image, encoder, nullptr, nullptr);
    heif_context_write_to_file(context, (folder / "s.heic").c_str());
    heif_encoder_release(encoder);
    heif_context_free(context);
    heif_image_release(image);
    const Photograph photograph = readPhotograph(folder / "s.heic");
    ASSERT_EQ(photograph.model, ColorModel::RgbAlpha);
    EXPECT_NEAR(photograph.samples[0], 100, 8);
    EXPECT_NEAR(photograph.samples[3], 64, 2);
}

// A thumbnail is made of the result; other formats have no place for it. Light levels hold of the old
// samples.
TEST(HeifFile, MakesItsThumbnailAnewAndNamesOtherProperties) {
    const TestFolder folder;
    Photograph photograph = testPhotograph(ColorModel::Rgb, 8, 200, 100, [](std::size_t) { return 200; });
    Metadata metadata;
    metadata.heifThumbnail = 64;
    const auto red = [](Photograph& of) {
        for (std::size_t i = 0; i < of.samples.size(); ++i)
            of.samples[i] = i % 3 == 0 ? 220 : 30;
    };
    for (const char* name : {"s.heic", "t.heic"}) {
        const Bytes file = encodeHeif(photograph, name, {}, metadata);
        folder.put(name, {file.begin(), file.end()});
        photograph = readPhotograph(folder / name);
        red(photograph);
        metadata = *photograph.metadata;
        EXPECT_EQ(metadata.heifThumbnail, 64) << name;
    }
    folder.run("vips thumbnail t.heic[thumbnail] u.png 64 && test $(vipsheader -f height u.png) = 32");
    EXPECT_THAT(folder.output("convert u.png -crop 1x1+30+16 -depth 8 txt:-"),
                testing::ContainsRegex("\\((21[0-9]|22[0-9]),(2[0-9]|3[0-9]),(2[0-9]|3[0-9])"));
    EXPECT_THAT(writePhotograph(photograph, folder / "t.jpg"),
                ElementsAre(EndsWith("cannot hold: the thumbnail")));
    folder.run("convert -size 64x64 xc:red p.png && vips heifsave p.png p.avif --compression av1 && "
               "LC_ALL=C sed 's/pixi/clli/' p.avif >s.avif");
    EXPECT_THAT(writePhotograph(readPhotograph(folder / "s.avif"), folder / "t.avif"),
                ElementsAre(EndsWith("cannot hold: the HEIF property clli")));
}

// A channel of transparency under another name is one of the pictures beside the picture.
TEST(HeifFile, NamesThePicturesThatItDrops) {
    const TestFolder folder;
    folder.run("convert $S/coffee.png -resize 128x96! -alpha set -channel A -evaluate set 50% a.png && "
               "vips heifsave a.png alpha.heic");
    EXPECT_EQ(readPhotograph(folder / "alpha.heic").model, ColorModel::RgbAlpha);
    const std::pair<const char*, const char*> cases[] = {{"urn:com:tst:aux:hdrgainmap", "the gain map"},
                                                         {"urn:mpeg:hevc:2015:auxid:2", "the depth map"}};
    for (const auto& [kind, name] : cases) {
        folder.run(std::string("sed 's/urn:mpeg:hevc:2015:auxid:1/") + kind + "/' alpha.heic > s.heic");
        const Photograph photograph = readPhotograph(folder / "s.heic");
        EXPECT_EQ(photograph.model, ColorModel::Rgb);
        EXPECT_THAT(writePhotograph(photograph, folder / "t.jpg", overwriting()),
                    ElementsAre((folder / "s.heic").string() + ": the JPEG file cannot hold: " + name));
    }
}

TEST(HeifFile, ReadsBoxesThatAreCutAnywhere) {
    const TestFolder folder;
    folder.run("convert $S/coffee.png -resize 128x96! p.png && vips heifsave p.png s.heic");
    const std::string text = folder.text("s.heic");
    const Bytes file(text.begin(), text.end());
    for (std::size_t size = 0; size < std::min<std::size_t>(file.size(), 900); ++size)
        EXPECT_EQ(heifCoding(ByteView(file).first(size)).value_or(HeifCoding()).chroma, Chroma::Half) << size;
}

volatile std::size_t excessive = std::size_t{1} << 46;

std::string failureOf(const std::function<void(const ChildProcess::Sink&)>& work) {
    try {
        ChildProcess(work).receive<int>();
    } catch (const ChildFailure& failure) {
        return failure.what();
    } catch (const std::bad_alloc&) {
        return "memory";
    }
    return "none";
}

TEST(ChildProcess, TellsHowItEnded) {
    EXPECT_EQ(failureOf([](const auto& sink) { sink.send(7); }), "none");
    EXPECT_EQ(failureOf([](const auto&) { throw std::runtime_error("broken"); }), "broken");
    EXPECT_EQ(failureOf([](const auto&) { throw std::bad_alloc(); }), "memory");
    EXPECT_EQ(failureOf([](const auto&) { std::raise(SIGKILL); }), "memory");
    EXPECT_THAT(failureOf([](const auto&) { std::raise(SIGTERM); }), HasSubstr("signal 15"));
#if !defined(__SANITIZE_ADDRESS__) // it ends the process itself
    // A thread's exception ends the process; so does an allocation that fails on any thread.
    EXPECT_EQ(
        failureOf([](const auto&) { std::thread([] { Bytes().reserve(std::size_t{1} << 46); }).join(); }),
        "memory");
#endif
}

TEST(ChildProcess, IsGivenUpWhenItDoesNothingForLong) {
    EXPECT_EQ(failureOf([](const auto&) { ::pause(); }), "the codec hangs");
}

TEST(ChildProcess, IsGivenUpWhenAsked) {
    std::atomic<bool> stop{false};
    ChildProcess child([](const auto& sink) {
        sink.send(1);
        ::pause();
    });
    EXPECT_EQ(child.receive<int>(&stop), 1);
    stop = true;
    EXPECT_THROW(child.receive<int>(&stop), StoppedError);
}

} // namespace
