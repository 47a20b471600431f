// Files of cameras through every format, tag by tag: another program reads source and result.

#include "files/PhotographReader.h"
#include "files/PhotographWriter.h"
#include "hosts/TestFiles.h"

#include <gmock/gmock.h>

using namespace orvela;

namespace {

namespace fs = std::filesystem;
using testing::HasSubstr;

// Places within the whole file, edges, and what a thumbnail made anew changes.
constexpr char kList[] =
    "exiftool -q -q -m -a -u -ee -G1 -s -n -IFD0:all -ExifIFD:all -GPS:all -InteropIFD:all -MakerNotes:all "
    "-IPTC:all -Photoshop:all -XMP:all -x ExifImageWidth -x ExifImageHeight -x PreviewImageStart "
    "-x OriginalDecisionDataOffset -x PreviewImage ";
// What belongs to the samples of a TIFF, or to those of the JPEG that it comes from.
constexpr char kStorage[] =
    "-x ImageWidth -x ImageHeight -x BitsPerSample -x Compression -x PhotometricInterpretation "
    "-x StripOffsets -x SamplesPerPixel -x RowsPerStrip -x StripByteCounts -x PlanarConfiguration "
    "-x Predictor -x SampleFormat -x YCbCrPositioning -x YCbCrSubSampling -x YCbCrCoefficients "
    "-x XResolution -x YResolution -x ResolutionUnit ";

std::vector<fs::path> cameraFiles() {
    std::vector<fs::path> files;
    for (const auto& entry : fs::directory_iterator(ORVELA_PHOTOS "/camera"))
        if (entry.path().extension() == ".jpg")
            files.push_back(entry.path());
    return files;
}

class CameraFiles : public testing::TestWithParam<const char*> {};

TEST_P(CameraFiles, KeepEveryTag) {
    const std::string extension = GetParam();
    const TestFolder folder;
    fs::create_directories(folder / "before");
    fs::create_directories(folder / "after");
    fs::create_directories(folder / "back");
    // What is decoded from a HEIF is upright.
    const std::string left =
        std::string(extension == "jpg" ? "" : kStorage) + (extension == "heic" ? "-x Orientation " : "");
    const auto list = [&](const std::string& in) {
        folder.run(kList + left + "-w! " + in + "/%f.txt " + in);
    };
    for (const fs::path& file : cameraFiles()) {
        const std::string name = file.stem().string();
        fs::copy(file, folder / "before");
        const fs::path target = folder / ("after/" + name + "." + extension);
        EXPECT_THAT(writePhotograph(readPhotograph(file), target),
                    testing::Each(testing::StartsWith(file.string() + ": the " +
                                                      formatName(*formatOfExtension(target)) +
                                                      " file cannot hold: the thumbnail")));
        const Photograph result = readPhotograph(target);
        // In other units, and to whole pixels per metre in a PNG, what the file said.
        EXPECT_NEAR(result.xResolution, readPhotograph(file).xResolution, 5e-4) << target;
        writePhotograph(result, folder / ("back/" + name + ".jpg"));
    }
    for (const char* in : {"before", "after", "back"})
        list(in);
    for (const fs::path& file : cameraFiles()) {
        const std::string text = file.stem().string() + ".txt";
        EXPECT_THAT(folder.text("before/" + text), HasSubstr("Make")) << text;
        EXPECT_EQ(folder.text("after/" + text), folder.text("before/" + text)) << text;
        EXPECT_EQ(folder.text("back/" + text), folder.text("before/" + text)) << text;
    }
}

INSTANTIATE_TEST_SUITE_P(Into, CameraFiles, testing::Values("jpg", "png", "webp", "heic", "tif"),
                         [](const auto& extension) { return std::string(extension.param); });

// Of each: what the thumbnail shows is the picture that is written, in the old one's size and place.
TEST(CameraFiles, ShowTheResultInTheirThumbnails) {
    const TestFolder folder;
    for (const char* name : {"canon-eos-300d", "canon-powershot-s40", "nikon-e950"}) {
        const std::string source = std::string(ORVELA_PHOTOS "/camera/") + name + ".jpg";
        Photograph photograph = readPhotograph(source);
        for (std::size_t i = 0; i < photograph.samples.size(); ++i)
            photograph.samples[i] = i % 3 == 0 ? 200 : 60;
        const std::string result = std::string(name) + ".jpg";
        EXPECT_THAT(writePhotograph(photograph, folder / result), testing::IsEmpty());
        const auto thumbnail = [&](const std::string& file) {
            return "exiftool -b -ThumbnailImage " + file + " >t.jpg && convert t.jpg";
        };
        const std::string size = " -format '%w %h' info:";
        EXPECT_EQ(folder.output(thumbnail(result) + size), folder.output(thumbnail(source) + size));
        const std::string colour =
            folder.output(thumbnail(result) + " -gravity center -crop 4x4+0+0 -resize 1x1! txt:-");
        EXPECT_THAT(colour, testing::ContainsRegex("\\((19[0-9]|20[0-9]),(5[0-9]|6[0-9]),(5[0-9]|6[0-9])"));
        const std::string place = "exiftool -s3 -IFD0:XResolution -IFD1:ThumbnailOffset ";
        EXPECT_EQ(folder.output(place + result), folder.output(place + source)) << name;
    }
}

} // namespace
