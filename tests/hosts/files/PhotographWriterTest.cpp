#include "files/PhotographWriter.h"

#include "files/PhotographReader.h"
#include "files/TargetFile.h"
#include "hosts/TestFiles.h"
#include "hosts/TestPhotograph.h"

#include <gmock/gmock.h>
#include <sys/mount.h>
#include <sys/resource.h>
#include <sys/wait.h>

#include <csignal>

using namespace orvela;

namespace {

namespace fs = std::filesystem;
using testing::HasSubstr;

Photograph plain(ColorModel model, int depth = 8, int width = 40, int height = 30) {
    const auto hardlyCompressible = [](std::size_t i) { return i * i % 251; };
    return testPhotograph(model, depth, width, height, hardlyCompressible);
}

template <typename Error>
std::string refusal(const Photograph& photograph, const fs::path& target, const WriteOptions& options = {}) {
    try {
        writePhotograph(photograph, target, options);
    } catch (const Error& error) {
        EXPECT_THAT(error.what(), testing::StartsWith(target.string() + ": "));
        EXPECT_THAT(error.what(), HasSubstr("; "));
        return error.what();
    }
    return "written";
}

TEST(PhotographWriter, RefusesWhatTheFormatCannotHold) {
    const TestFolder folder;
    using enum ColorModel;
    const struct {
        ColorModel model;
        int depth;
        const char* target;
        const char* advice;
    } cases[] = {{Cmyk, 8, "a.png", "TIFF target"}, {Cmyk, 8, "a.webp", "TIFF target"},
                 {Rgb, 8, "a.psd", "TIFF target"},  {Cmyk, 8, "a.avif", "TIFF target"},
                 {Rgb, 8, "a.bmp", "use .jpg"},     {Rgb, 8, "a", "use .jpg"}};
    for (const auto& c : cases)
        EXPECT_THAT(refusal<PhotographError>(plain(c.model, c.depth), folder / c.target), HasSubstr(c.advice))
            << c.target;
    EXPECT_THAT(refusal<PhotographError>(plain(Rgb, 8, 16384, 1), folder / "a.webp"), HasSubstr("16383"));
    EXPECT_EQ(folder.count(), 0U);
    EXPECT_EQ(defaultTarget("x/a.b.JPEG", FileFormat::Jpeg), "x/a.b-enhanced.JPEG");
    EXPECT_EQ(defaultTarget("a.jpg", FileFormat::Png), "a-enhanced.png");
    EXPECT_EQ(defaultTarget("a.psd", FileFormat::Psd), "a-enhanced.tif");
}

TEST(PhotographWriter, NeverReplacesUnaskedNorItsOwnSource) {
    const TestFolder folder;
    folder.run(
        "cp $S/rocket.jpg s.jpg && ln -s s.jpg soft.jpg && ln s.jpg hard.jpg && echo old > other.png && "
        "ln -s nowhere dangling.png && mkdir f.png");
    const Photograph photograph = readPhotograph(folder / "s.jpg");
    WriteOptions force;
    force.overwrite = true;
    for (const char* name : {"s.jpg", "soft.jpg", "hard.jpg"})
        EXPECT_THAT(refusal<TargetError>(photograph, folder / name, force),
                    HasSubstr("the photograph itself"))
            << name;
    folder.run("cmp s.jpg $S/rocket.jpg");
    EXPECT_THAT(refusal<TargetError>(photograph, folder / "other.png"), HasSubstr("exists already"));
    EXPECT_THAT(refusal<TargetError>(photograph, folder / "dangling.png"), HasSubstr("exists already"));
    EXPECT_THAT(refusal<TargetError>(photograph, folder / "f.png", force), HasSubstr("is a folder"));
    EXPECT_EQ(folder.text("other.png"), "old\n");
    writePhotograph(photograph, folder / "other.png", force);
    EXPECT_EQ(readPhotograph(folder / "other.png").samples, photograph.samples);
}

// A file that appears between the check and the end of the writing stays.
TEST(PhotographWriter, LeavesAFileThatAppearsMeanwhile) {
    const TestFolder folder;
    TargetFile file(folder / "t.png");
    file.write(Bytes(10, 1), nullptr);
    folder.put("t.png", "mine");
    EXPECT_THROW(file.commit(false), TargetError);
    EXPECT_EQ(folder.text("t.png"), "mine");
}

TEST(PhotographWriter, NamesTheCauseOfATargetFaultAndLeavesNothing) {
    const TestFolder folder;
    folder.run("echo x > file && mkdir full limit && chmod 755 .");
    const Photograph photograph = plain(ColorModel::Rgb, 8, 400, 300);
    EXPECT_THAT(refusal<TargetError>(photograph, folder / "none/a.png"), HasSubstr("does not exist"));
    EXPECT_THAT(refusal<TargetError>(photograph, folder / "file/a.png"), HasSubstr("not a folder"));
    EXPECT_THAT(refusal<TargetError>(photograph, folder / (std::string(300, 'n') + ".png")),
                HasSubstr("too long"));
    EXPECT_THAT(refusal<TargetError>(photograph, "/proc/a.png"), HasSubstr(": "));

    // Where mounting is not allowed, the size limit below stands for the full disk.
    const std::string full = (folder / "full").string();
    if (::mount("tmpfs", full.c_str(), "tmpfs", 0, "size=64k") == 0) {
        EXPECT_THAT(refusal<TargetError>(photograph, folder / "full/a.tif"), HasSubstr("the disk is full"));
        EXPECT_TRUE(fs::is_empty(full));
        EXPECT_EQ(::mount("tmpfs", full.c_str(), "tmpfs", MS_REMOUNT | MS_RDONLY, "size=64k"), 0);
        EXPECT_THAT(refusal<TargetError>(photograph, folder / "full/a.tif"), HasSubstr("read-only"));
        ::umount(full.c_str());
    }

    std::signal(SIGXFSZ, SIG_IGN);
    const rlimit small{50000, RLIM_INFINITY};
    ::setrlimit(RLIMIT_FSIZE, &small);
    const std::string text = refusal<TargetError>(photograph, folder / "limit/a.tif");
    const rlimit any{RLIM_INFINITY, RLIM_INFINITY};
    ::setrlimit(RLIMIT_FSIZE, &any);
    EXPECT_THAT(text, HasSubstr("larger than the system allows"));
    EXPECT_TRUE(fs::is_empty(folder / "limit"));
}

TEST(PhotographWriter, StopsWhenAskedAndLeavesNothing) {
    const TestFolder folder;
    std::atomic<bool> stop{true};
    WriteOptions options;
    options.stop = &stop;
    EXPECT_THROW(writePhotograph(plain(ColorModel::Rgb), folder / "a.png", options), StoppedError);
    TargetFile(folder / "b.png").write(ByteView()); // given up before the commit
    EXPECT_EQ(folder.count(), 0U);
}

// The final name shows up whole or not at all, whenever the process dies.
TEST(PhotographWriter, KilledInTheMiddleLeavesNoPartUnderTheFinalName) {
    const TestFolder folder;
    int unfinished = 0;
    for (int delay = 0; delay < 60; delay += 4) {
        const pid_t child = ::fork();
        if (child == 0) {
            TargetFile file(folder / "a.tif");
            for (int piece = 0; piece < 200; ++piece) {
                file.write(Bytes(1000, 7), nullptr);
                ::usleep(100);
            }
            file.commit(true);
            ::_exit(0);
        }
        ::usleep(static_cast<useconds_t>(delay) * 1000);
        ::kill(child, SIGKILL);
        ::waitpid(child, nullptr, 0);
        if (!fs::exists(folder / "a.tif"))
            ++unfinished;
        else
            EXPECT_EQ(fs::file_size(folder / "a.tif"), 200000U);
        fs::remove(folder / "a.tif");
    }
    EXPECT_GT(unfinished, 0);
    TargetFile(folder / "a.tif").commit(true);
    EXPECT_EQ(folder.count(), 1U) << "the next run removes what the killed ones left";
}

// Others that write the same target keep what they write, however many are killed meanwhile.
TEST(PhotographWriter, LeavesTheTemporariesOfLivingProcesses) {
    const TestFolder folder;
    std::vector<pid_t> children;
    for (int i = 0; i < 8; ++i) {
        children.push_back(::fork());
        if (children.back() != 0)
            continue;
        for (int round = 0; round < 40; ++round) {
            TargetFile file(folder / "a.tif");
            file.write(Bytes(1000, static_cast<std::uint8_t>(i)));
            ::usleep(500);
            file.write(Bytes(1000, static_cast<std::uint8_t>(i)));
            file.commit(true);
        }
        ::_exit(0);
    }
    ::usleep(20000);
    ::kill(children[0], SIGKILL);
    ::kill(children[1], SIGKILL);
    for (std::size_t i = 0; i < children.size(); ++i) {
        int status = -1;
        ::waitpid(children[i], &status, 0);
        EXPECT_EQ(status, i < 2 ? SIGKILL : 0);
    }
    const std::string text = folder.text("a.tif");
    EXPECT_EQ(text, std::string(2000, text.at(0)));
    TargetFile(folder / "a.tif").commit(true);
    EXPECT_EQ(folder.count(), 1U);
}

// Given settings go before the source's.
TEST(PhotographWriter, TakesGivenSettings) {
    const TestFolder folder;
    WriteOptions options;
    options.progressive = true;
    options.compression = "packbits";
    for (const char* name : {"a.tif", "a.png"})
        writePhotograph(plain(ColorModel::Rgb), folder / name, options);
    EXPECT_EQ(readPhotograph(folder / "a.tif").encoding.compression, "packbits");
    EXPECT_TRUE(readPhotograph(folder / "a.png").encoding.progressive);
    options.compression = "unknown";
    EXPECT_THAT(refusal<PhotographError>(plain(ColorModel::Rgb), folder / "b.tif", options),
                HasSubstr("other settings"));
}

} // namespace
