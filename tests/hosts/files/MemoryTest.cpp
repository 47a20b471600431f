#include "files/Memory.h"

#include "files/DeclaredPicture.h"
#include "files/PhotographReader.h"
#include "files/Refusal.h"
#include "hosts/TestFiles.h"

#include <gmock/gmock.h>

using namespace orvela;

namespace {

// A machine that can give 1000 KiB and swap 24, with the groups that a test adds.
class GrantedMemory : public testing::Test {
protected:
    GrantedMemory() {
        mRoot.run("mkdir -p proc/self sys/fs/cgroup && "
                  "printf 'MemTotal: 9999 kB\\nMemAvailable: 1000 kB\\nSwapFree: 24 kB\\n' > proc/meminfo");
    }

    // A group of the second version; its files hold 100 bytes of 150 that can be dropped.
    void group(const std::string& path, const std::string& limit, int used) const {
        mRoot.run("cd sys/fs/cgroup && mkdir -p ./" + path + " && cd ./" + path + " && echo " + limit +
                  " > memory.max && echo " + std::to_string(used) +
                  " > memory.current && printf 'anon 1\\ninactive_file 60\\nactive_file 40\\nshmem 50\\n' > "
                  "memory.stat");
    }

    TestFolder mRoot;
};

TEST_F(GrantedMemory, IsThatOfTheMachineWithoutGroups) {
    EXPECT_EQ(grantedMemory(mRoot.path().string()), 1024U * 1024);
    mRoot.run("rm proc/meminfo");
    EXPECT_EQ(grantedMemory(mRoot.path().string()), kUnlimited);
}

TEST_F(GrantedMemory, IsTheLeastOfAllGroupsAround) {
    mRoot.run("echo 0::/user/work > proc/self/cgroup");
    group("user/work", "max", 800);
    EXPECT_EQ(grantedMemory(mRoot.path().string()), 1024U * 1024);
    group("user", "50000", 20100);
    EXPECT_EQ(grantedMemory(mRoot.path().string()), 30000U);
    group("user/work", "900", 800);
    EXPECT_EQ(grantedMemory(mRoot.path().string()), 200U);
    group("user/work", "900", 2000);
    EXPECT_EQ(grantedMemory(mRoot.path().string()), 0U);
}

// In a container the path is that of the outer system and the files stand at the top.
TEST_F(GrantedMemory, KnowsBothVersionsAndContainers) {
    mRoot.run("echo 0::/../../elsewhere > proc/self/cgroup");
    group("", "700", 300);
    EXPECT_EQ(grantedMemory(mRoot.path().string()), 500U);
    mRoot.run(
        "rm -r sys/fs/cgroup && printf '5:cpu,cpuacct:/x\\n4:hugetlb,memory:/docker/1\\n1:name=s:/\\n' > "
        "proc/self/cgroup && mkdir -p sys/fs/cgroup/memory && cd sys/fs/cgroup/memory && "
        "echo 6000 > memory.limit_in_bytes && echo 5000 > memory.usage_in_bytes && "
        "printf 'cache 9\\ntotal_inactive_file 3\\ntotal_active_file 4\\n' > memory.stat");
    EXPECT_EQ(grantedMemory(mRoot.path().string()), 1007U);
}

std::string refusal(const DeclaredPicture& picture, const ReadLimits& limits = {}) {
    try {
        checkPicture(picture, "p.tif", limits);
    } catch (const MemoryError& error) {
        return std::string("memory: ") + error.what();
    } catch (const PhotographError& error) {
        return error.what();
    }
    return "taken";
}

TEST(DeclaredPicture, IsRefusedWithTheNumbersOfWhatItBreaks) {
    using testing::HasSubstr;
    const DeclaredPicture full = {.width = 32767, .height = 32767, .sampleBytes = 8, .fileBytes = 1000};
    EXPECT_EQ(refusal({.width = 32767, .height = 30, .sampleBytes = 8}), "taken");
    // 32767 * 32767 pixels of 2 * 8 + 9 bytes.
    EXPECT_THAT(refusal(full, {.sampleCopies = 2, .workBytes = 9'000'000}),
                testing::AllOf(testing::StartsWith("memory: p.tif: its 32767 x 32767 pixels need about "),
                               HasSubstr("9663")));
    EXPECT_THAT(refusal({.width = 32768, .height = 1}), HasSubstr("over 32767"));
    EXPECT_THAT(refusal({.width = 9, .height = 0}), HasSubstr("no pixels"));
    EXPECT_EQ(refusal({.width = 80, .height = 10, .fileBytes = 100, .mostPixelsPerByte = 8}), "taken");
    EXPECT_THAT(refusal({.width = 801, .height = 1, .fileBytes = 100, .mostPixelsPerByte = 8}),
                HasSubstr("801 x 1 pixels, more than its 100 bytes can hold"));
    EXPECT_EQ(refusal({.width = 1000, .height = 1500}, {.megapixels = 1.5}), "taken");
    EXPECT_THAT(refusal({.width = 1001, .height = 1500}, {.megapixels = 1.5}),
                HasSubstr("1.5015 megapixels (1001 x 1500 pixels), more than the 1.5 megapixels"));
}

// Blank pictures are the smallest files that each coding makes.
TEST(DeclaredPicture, OfNothingButWhiteIsTaken) {
    const TestFolder folder;
    folder.run(
        "convert -size 2500x1600 xc:white -depth 8 w.miff && "
        "convert w.miff -monochrome -define png:bit-depth=1 -quality 95 bits.png && "
        "convert w.miff -quality 95 PNG24:rgb.png && convert w.miff -depth 16 -quality 95 PNG48:deep.png && "
        "convert w.miff -colorspace Gray -sampling-factor 1x1 -quality 5 -interlace none grey.jpg && "
        "convert w.miff -quality 5 -sampling-factor 2x2 -interlace JPEG half.jpg && "
        "convert w.miff -compress RLE runs.psd && convert w.miff -define webp:lossless=true w.webp && "
        "for c in None RLE LZW Zip; do convert w.miff -define tiff:rows-per-strip=1600 -compress $c $c.tif; "
        "convert w.miff -monochrome -compress $c bits-$c.tif; done; "
        "for c in Group4 Fax; do convert w.miff -monochrome -compress $c $c.tif; done; rm w.miff");
    for (const auto& file : std::filesystem::directory_iterator(folder.path()))
        if (const std::string name = file.path().filename(); name != "log") {
            const Photograph photograph = readPhotograph(file.path());
            EXPECT_EQ(photograph.width, 2500) << name;
            EXPECT_GT(photograph.samples.at(3'999'999), 240) << name;
        }
}

// One colour is the least that a picture can be: a file that claims more for its size is refused, not this.
TEST(DeclaredPicture, OfOneColourIsTaken) {
    const TestFolder folder;
    folder.run(
        "convert -size 6000x4000 'xc:rgb(90,140,200)' -depth 8 -type TrueColor -compress none f.tif && "
        "for c in zstd webp; do vips tiffsave f.tif $c.tif --compression $c --Q 1 --tile --tile-width 4096 "
        "--tile-height 4096; done && "
        "vips tiffsave f.tif jpeg.tif --compression jpeg --Q 20 && "
        "convert f.tif -define tiff:rows-per-strip=4000 -compress LZMA lzma.tif && "
        "vips webpsave f.tif lossy.webp --Q 0 && "
        "convert f.tif -crop 3000x2000+0+0 +repage c.tif && "
        "vips heifsave c.tif f.heic --Q 1 --effort 0 && rm c.tif && "
        "vips heifsave f.tif f.avif --Q 1 --effort 0 --compression av1 && rm f.tif");
    for (const auto& file : std::filesystem::directory_iterator(folder.path()))
        if (const std::string name = file.path().filename(); name != "log") {
            const Photograph photograph = readPhotograph(file.path());
            EXPECT_EQ(photograph.width * photograph.height, name == "f.heic" ? 6'000'000 : 24'000'000)
                << name;
            EXPECT_NEAR(photograph.samples.back(), 200, 40) << name;
        }
}

// The same value in every place where a file of 64 x 64 pixels tells its edges.
std::string claiming(std::string file, const std::string& width, const std::string& height,
                     const std::string& claimed) {
    for (const std::string& edge : {width, height}) {
        EXPECT_NE(file.find(edge), file.npos);
        file.replace(file.find(edge) + edge.size() - claimed.size(), claimed.size(), claimed);
    }
    return file;
}

TEST(DeclaredPicture, OfMoreThanAFewBytesCanHoldIsRefused) {
    using namespace std::string_literals;
    const TestFolder folder;
    folder.run("convert $S/coffee.png -resize 64x64! -depth 8 p.png && "
               "for c in jpeg zstd webp; do vips copy p.png $c.tif[compression=$c]; done && "
               "convert p.png -compress LZMA lzma.tif && "
               "for c in Group4 Fax; do convert p.png -monochrome -compress $c $c.tif; done && "
               "convert p.png -strip -quality 80 lossy.webp && vips copy p.png photo.heic && rm p.png log");
    for (const auto& file : std::filesystem::directory_iterator(folder.path())) {
        const std::string name = file.path().filename();
        const std::string whole = folder.text(name);
        std::string claims;
        if (name.ends_with(".tif"))
            claims = claiming(whole, "\0\1\3\0\1\0\0\0\x40\0"s, "\1\1\3\0\1\0\0\0\x40\0"s, "\x30\x75"s);
        else if (name.ends_with(".webp"))
            claims = claiming(whole, "\x9D\x01\x2A\x40\0"s, "\x9D\x01\x2A\xFF\x3F\x40\0"s, "\xFF\x3F"s);
        else
            claims = claiming(whole, "ispe\0\0\0\0\0\0\0\x40"s, "ispe\0\0\0\0\0\0\x75\x30\0\0\0\x40"s,
                              "\x75\x30"s);
        folder.put("claims", claims);
        try {
            readPhotograph(folder / "claims");
            ADD_FAILURE() << name;
        } catch (const PhotographError& error) {
            EXPECT_THAT(error.what(), testing::HasSubstr("more than its " + std::to_string(whole.size()) +
                                                         " bytes can hold"))
                << name;
        }
        std::filesystem::remove(folder / "claims");
    }
}

// What libraries say of memory is not laid to the file's charge.
TEST(Refusal, TellsWantOfMemoryFromDamage) {
    for (const char* text : {"No space for YCbCr->RGB conversion state", "out of memory --- size == 3MB",
                             "error creating thread: Resource temporarily unavailable", "calloc failed (1)"})
        EXPECT_THROW(refuseUnread("p.tif", text), MemoryError) << text;
    try {
        refuseUnread("p.tif", std::string(500, 'x'));
    } catch (const MemoryError&) {
        ADD_FAILURE();
    } catch (const PhotographError& error) {
        EXPECT_THAT(error.what(), testing::StartsWith("p.tif: is damaged or cut short (x"));
        EXPECT_LT(std::string(error.what()).size(), 220U);
    }
}

} // namespace
