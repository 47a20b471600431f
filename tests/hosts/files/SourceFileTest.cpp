#include "files/SourceFile.h"

#include "files/Photograph.h"
#include "files/TiffDecoder.h"
#include "hosts/TestFiles.h"

#include <algorithm>
#include <csignal>

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

// Its n-th reading fails.
class FailingTiff : public TiffStream {
public:
    FailingTiff(std::string bytes, int failing) : mBytes(std::move(bytes)), mLeft(failing) {}

    std::size_t read(std::uint64_t at, std::span<std::uint8_t> to) override {
        if (--mLeft == 0)
            throw std::runtime_error("the disk failed");
        const std::size_t first = std::min<std::size_t>(at, mBytes.size());
        return mBytes.copy(reinterpret_cast<char*>(to.data()), to.size(), first);
    }
    void write(std::uint64_t, ByteView) override {}
    std::uint64_t size() const override { return mBytes.size(); }

private:
    std::string mBytes;
    int mLeft;
};

// The library tells only that it could not read; of a page the samples come last, in pieces.
TEST(TiffStreamOfVips, TellsWhatStoppedItAtWhicheverRead) {
    const TestFolder folder;
    folder.run("vips tiffsave $S/rocket.jpg s.tif --compression lzw");
    const std::string bytes = folder.text("s.tif");
    int failing = 1;
    for (std::string told = "the disk failed"; told != "read"; ++failing) {
        FailingTiff stream(bytes, failing);
        try {
            EXPECT_EQ(decodeTiff(stream, "s.tif").samples.size() % 3, 0u);
            told = "read";
        } catch (const std::exception& error) {
            told = error.what();
        }
        ASSERT_TRUE(told == "the disk failed" || told == "read") << failing << ": " << told;
    }
    EXPECT_GT(failing, 20); // most of them while samples were taken
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
