#include "files/PhotographReader.h"
#include "files/PhotographWriter.h"
#include "hosts/TestFiles.h"

#include <gmock/gmock.h>

using namespace orvela;

namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

// Puts chunks into a PNG, and behind an AVIF the track of an image sequence.
constexpr char kMake[] = R"(python3 - <<'END'
import struct, zlib
def chunk(name, data):
    return struct.pack('>I', len(data)) + name + data + struct.pack('>I', zlib.crc32(name + data))
def box(name, *parts):
    return struct.pack('>I', 8 + sum(map(len, parts))) + name + b''.join(parts)
still = open('p.png', 'rb').read()
at, end = still.index(b'IDAT') - 4, still.index(b'IEND') - 4
size = struct.unpack('>II', still[16:24])
def frame(number):
    return chunk(b'fcTL', struct.pack('>IIIIIHHBB', number, *size, 0, 0, 1, 10, 0, 0))
def animation(name, frames, first):
    more = chunk(b'fdAT', struct.pack('>I', 2) + still[at + 8:end - 4])
    head = chunk(b'acTL', struct.pack('>II', frames, 0)) + (frame(0) if first else b'')
    open(name, 'wb').write(still[:at] + head + still[at:end] + frame(1) + more + still[end:])
animation('three.png', 3, True)
animation('hidden.png', 1, False)
animation('one.png', 1, True)
photo = open('p.avif', 'rb').read()
def sequence(name, frames, handler):
    sizes = box(b'stsz', struct.pack('>III', 0, 100, frames))
    media = box(b'mdia', box(b'hdlr', bytes(8), handler, bytes(13)), box(b'minf', box(b'stbl', sizes)))
    open(name, 'wb').write(photo + box(b'moov', box(b'mvhd', bytes(100)), box(b'trak', box(b'tkhd', bytes(84)), media)))
sequence('twelve.avif', 12, b'pict')
sequence('sound.avif', 12, b'soun')
open('bare.avif', 'wb').write(photo[:photo.index(b'meta') - 4] + open('twelve.avif', 'rb').read()[len(photo):])
END
)";

TEST(Animations, AreRefusedByNameUnlessTheFirstFrameIsAskedFor) {
    const TestFolder folder;
    folder.run(
        "convert $S/coffee.png -resize 64x48! p.png && vips heifsave p.png p.avif --compression av1 && "
        "convert p.png '(' p.png -negate ')' '(' p.png -flip ')' a.webp");
    folder.run(kMake);
    const struct {
        const char* name;
        const char* cause;
        const char* note;
    } animations[] = {
        {"a.webp", "is an animation of 3 frames; --first-frame", "the other 2 frames"},
        {"three.png", "is an animation of 3 frames; --first-frame", "cannot hold: the other 2 frames"},
        {"hidden.png", "is an animation of 2 frames; --first-frame", "cannot hold: the other frame"},
        {"twelve.avif", "is an image sequence of 12 frames; --first", "cannot hold: the other 11 frames"}};
    for (const auto& [name, cause, note] : animations) {
        try {
            readPhotograph(folder / name);
            ADD_FAILURE() << name;
        } catch (const PhotographError& error) {
            EXPECT_THAT(error.what(), testing::StartsWith((folder / name).string() + ": " + cause));
        }
        const Photograph first = readPhotograph(folder / name, {.firstOnly = true});
        EXPECT_EQ(first.samples.size(), 64U * 48 * 3) << name;
        EXPECT_THAT(writePhotograph(first, folder / "t.png"), ElementsAre(HasSubstr(note))) << name;
        folder.run("rm t.png");
    }
    for (const char* name : {"p.png", "one.png", "sound.avif"})
        EXPECT_THAT(readPhotograph(folder / name).unheld, IsEmpty()) << name;
    EXPECT_THROW(readPhotograph(folder / "bare.avif", {.firstOnly = true}), PhotographError);
}

TEST(Animations, AreNoSeveralStillPicturesOfAHeif) {
    const TestFolder folder;
    folder.run(
        "convert $S/coffee.png -resize 64x48! p.png && convert p.png '(' p.png -resize 32x24! ')' s.heic");
    const Photograph main = readPhotograph(folder / "s.heic");
    EXPECT_EQ(main.width, 64);
    EXPECT_THAT(writePhotograph(main, folder / "t.heic"), ElementsAre(HasSubstr("1 further picture")));
}

} // namespace
