#include "files/SourceFile.h"

#include "files/Photograph.h"
#include "files/TiffFile.h"
#include "files/TiffReader.h"
#include "hosts/TestFiles.h"

#include <gmock/gmock.h>

using namespace orvela;

namespace {

namespace fs = std::filesystem;

constexpr std::size_t kSize = 50'000;

class SourceFileView : public testing::Test {
protected:
    SourceFileView() { mFolder.put("s.tif", std::string(kSize, 'x')); }

    fs::path path() const { return mFolder / "s.tif"; }

    // What is told when that happens to the file between two looks at its bytes.
    template <typename Event>
    std::string refusal(const Event& event) {
        SourceFile file(path());
        try {
            file.look([&](ByteView bytes) {
                EXPECT_EQ(bytes[100], 'x');
                event();
                EXPECT_EQ(bytes[kSize - 1] + bytes[kSize / 2], 0);
                return 0;
            });
        } catch (const PhotographError& error) {
            return error.what();
        }
        return "looked at";
    }

    TestFolder mFolder;
};

// The system ends a program that looks at what its file does not hold any more.
TEST_F(SourceFileView, BearsThatTheFileBecomesShorter) {
    for (const std::uint64_t left : {0, 4096, 20'000}) {
        mFolder.put("s.tif", std::string(kSize, 'x'));
        EXPECT_EQ(refusal([&] { fs::resize_file(path(), left); }),
                  path().string() +
                      ": the file became shorter while it was read; try again when it is complete");
    }
}

TEST_F(SourceFileView, TellsThatTheFileWasWrittenAnew) {
    mFolder.put("s.tif", std::string(kSize, 'x'));
    SourceFile file(path());
    const auto rewrite = [&](ByteView bytes) {
        fs::resize_file(path(), 0);
        EXPECT_EQ(bytes[kSize - 1], 0);
        fs::resize_file(path(), kSize);
        return 0;
    };
    EXPECT_THROW(file.look(rewrite), PhotographError);
    EXPECT_THROW(file.look([](ByteView) { return 0; }), PhotographError); // the view stays without its bytes
}

// Of a page the samples come last, in pieces, and the library tells only that it could not read.
TEST_F(SourceFileView, TellsThatTheFileBecameShorterWhileSamplesWereRead) {
    constexpr std::uint64_t edge = 2000;
    constexpr std::uint64_t strips = 100;
    constexpr std::uint64_t begin = 1200;
    constexpr std::uint64_t bytes = edge * edge / strips;
    std::string tiff("II*\0\x8\0\0\0\x9\0", 10);
    const auto put = [&tiff](std::uint64_t value, int size) {
        for (int i = 0; i < size; ++i)
            tiff += static_cast<char>(value >> 8 * i);
    };
    const auto field = [&](std::uint64_t tag, std::uint64_t count, std::uint64_t value) {
        put(tag, 2);
        put(4, 2);
        put(count, 4);
        put(value, 4);
    };
    for (const auto& [tag, value] :
         {std::pair<std::uint64_t, std::uint64_t>{256, edge}, {257, edge}, {258, 8}, {259, 1}, {262, 1}})
        field(tag, 1, value);
    field(273, strips, 200);
    field(277, 1, 1);
    field(278, 1, edge / strips);
    field(279, strips, 600);
    tiff.resize(200);
    for (std::uint64_t strip = 0; strip < strips; ++strip)
        put(begin + strip * bytes, 4);
    for (std::uint64_t strip = 0; strip < strips; ++strip)
        put(bytes, 4);
    tiff.resize(begin + edge * edge);
    mFolder.put("s.tif", tiff);
    SourceFile file(path());
    const TiffFile parsed(file);
    fs::resize_file(path(), 1'000'000);
    try {
        readTiffPage(file, parsed, 0, {});
        FAIL() << "There were not enough bytes.";
    } catch (const PhotographError& error) {
        EXPECT_THAT(error.what(), testing::HasSubstr("became shorter while it was read"));
    }
}

// Of the cause that parsing tells and that of the file, the latter.
TEST_F(SourceFileView, TellsTheCauseOfAFailure) {
    SourceFile file(path());
    const auto fail = [](ByteView) -> int { throw DamagedBytes("a directory"); };
    EXPECT_THROW(file.look(fail), DamagedBytes);
    fs::resize_file(path(), 100);
    EXPECT_THROW(file.look(fail), PhotographError);
}

TEST_F(SourceFileView, LeavesOtherFaultsAlone) {
    EXPECT_DEATH(SourceFile(path()).look([](ByteView) { return ::raise(SIGBUS); }), "");
}

} // namespace
