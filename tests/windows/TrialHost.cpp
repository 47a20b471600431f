// A host that knows nothing of this project: it finds the fields of the record by their places in bytes,
// lends buffers for one request only, with rows longer than asked for, and looks at all that a module may not
// touch.
//   trial_host MODULE    tells on its output what failed; exit status 1 then
#include <windows.h>

#include <cstdint>
#include <cstdio>
#include <cstring>
#include <memory>
#include <string>
#include <vector>

namespace {

using PluginMain = void (*)(std::int16_t, void*, std::intptr_t*, std::int16_t*);

/// Where a field stands in the record.
struct Field {
    int on32;
    int on64;
};
constexpr Field kImageSize{16, 28}, kPlanes{20, 32}, kFilterRect{22, 34}, kMaxSpace{44, 56},
    kBufferSpace{48, 60}, kInRect{52, 64}, kInLoPlane{60, 72}, kInHiPlane{62, 74}, kOutRect{64, 76},
    kOutLoPlane{72, 84}, kOutHiPlane{74, 86}, kInData{76, 88}, kInRowBytes{80, 96}, kOutData{84, 100},
    kOutRowBytes{88, 108}, kMaskRect{96, 116}, kAdvanceState{224, 280}, kErrorString{360, 440},
    kDepth{380, 480};

/// A rectangle as it stands in the record.
struct Area {
    std::int16_t top, left, bottom, right;

    bool isEmpty() const { return top >= bottom || left >= right; }
    int width() const { return right - left; }
    int height() const { return bottom - top; }
};

int gFailures = 0;

void expect(bool holds, const std::string& what) {
    if (!holds) {
        std::printf("failed: %s\n", what.c_str());
        ++gFailures;
    }
}

class Record {
public:
    template <typename Value>
    void set(Field field, Value value) {
        std::memcpy(place(field), &value, sizeof value);
    }

    template <typename Value>
    Value get(Field field) const {
        Value value;
        std::memcpy(&value, const_cast<Record*>(this)->place(field), sizeof value);
        return value;
    }

    void* bytes() { return mBytes.data(); }

private:
    std::uint8_t* place(Field field) {
        return mBytes.data() + (sizeof(void*) == 4 ? field.on32 : field.on64);
    }

    std::vector<std::uint8_t> mBytes = std::vector<std::uint8_t>(1024);
};

/// What was lent to the module for one request.
struct Loan {
    std::vector<std::uint8_t> bytes;
    Area area{};
    int plane = 0;
    int rowBytes = 0;
};

constexpr std::uint8_t kUntouched = 0xa5;

class Run {
public:
    static constexpr std::int16_t kWidth = 23, kHeight = 17, kPlaneCount = 3;
    static constexpr Area kArea{2, 3, 16, 21};

    explicit Run(int depth)
        : mSample(depth / 8), mSamples(std::size_t{kWidth} * kHeight * kPlaneCount * mSample) {
        for (std::size_t i = 0; i < mSamples.size(); ++i) // 16-bit samples stay below 32768
            mSamples[i] = static_cast<std::uint8_t>(mSample == 2 && i % 2 == 1 ? i % 127 : i * 7);
        record.set(kImageSize, std::uint32_t{kWidth} << 16 | kHeight);
        record.set(kPlanes, kPlaneCount);
        record.set(kFilterRect, kArea);
        record.set(kMaxSpace, std::int32_t{1'000'000});
        record.set(kAdvanceState, &advance);
        record.set(kErrorString, text);
        record.set(kDepth, std::int32_t{depth});
        gCurrent = this;
    }

    /// Every sample within the area is the inverse of what it was, every other as it was.
    bool isInverseOf(const Run& before) const {
        for (int row = 0; row < kHeight; ++row)
            for (int column = 0; column < kWidth; ++column)
                for (int plane = 0; plane < kPlaneCount; ++plane) {
                    const bool isInside = row >= kArea.top && row < kArea.bottom && column >= kArea.left &&
                                          column < kArea.right;
                    const int was = before.sample(row, column, plane);
                    if (sample(row, column, plane) != (isInside ? (mSample == 2 ? 32768 : 255) - was : was))
                        return false;
                }
        return true;
    }

    Record record;
    std::uint8_t text[256] = {}; ///< the host's text, its length first
    int requests = 0;

private:
    static std::int16_t advance() { return gCurrent->next(); }

    std::int16_t next() {
        ++requests;
        if (mOut)
            store();
        mIn = lend(kInRect, kInLoPlane, kInHiPlane, kInData, kInRowBytes);
        mOut = lend(kOutRect, kOutLoPlane, kOutHiPlane, kOutData, kOutRowBytes);
        expect(record.get<Area>(kMaskRect).isEmpty(), "no mask is asked for");
        return 0;
    }

    std::unique_ptr<Loan> lend(Field rect, Field low, Field high, Field data, Field stride) {
        auto loan = std::make_unique<Loan>();
        loan->area = record.get<Area>(rect);
        loan->plane = record.get<std::int16_t>(low);
        if (loan->area.isEmpty()) {
            record.set<void*>(data, nullptr);
            return nullptr;
        }
        expect(loan->plane == record.get<std::int16_t>(high), "one plane is asked for");
        const int width = loan->area.width() * mSample;
        loan->rowBytes = width + 6;
        loan->bytes.assign(static_cast<std::size_t>(loan->rowBytes) * loan->area.height(), kUntouched);
        for (int row = 0; row < loan->area.height(); ++row)
            for (int column = 0; column < loan->area.width(); ++column)
                std::memcpy(&loan->bytes[row * loan->rowBytes + column * mSample],
                            place(loan->area.top + row, loan->area.left + column, loan->plane), mSample);
        record.set<void*>(data, loan->bytes.data());
        record.set(stride, std::int32_t{loan->rowBytes});
        return loan;
    }

    void store() {
        for (int row = 0; row < mOut->area.height(); ++row) {
            const std::uint8_t* from = &mOut->bytes[row * mOut->rowBytes];
            for (int column = 0; column < mOut->area.width(); ++column)
                std::memcpy(place(mOut->area.top + row, mOut->area.left + column, mOut->plane),
                            from + column * mSample, mSample);
            for (int i = mOut->area.width() * mSample; i < mOut->rowBytes; ++i)
                expect(from[i] == kUntouched, "nothing is written behind a row");
        }
    }

    std::uint8_t* place(int row, int column, int plane) {
        return &mSamples[((row * kWidth + column) * kPlaneCount + plane) * mSample];
    }

    int sample(int row, int column, int plane) const {
        const std::uint8_t* at = const_cast<Run*>(this)->place(row, column, plane);
        return mSample == 2 ? at[0] | at[1] << 8 : at[0];
    }

    static inline Run* gCurrent = nullptr;
    int mSample;
    std::vector<std::uint8_t> mSamples; ///< row by row, the planes of a pixel side by side
    std::unique_ptr<Loan> mIn, mOut;
};

class Module {
public:
    explicit Module(const wchar_t* file) : mModule(LoadLibraryW(file)) {
        expect(mModule != nullptr, "the module can be loaded");
        auto* const entry = mModule ? GetProcAddress(mModule, "PluginMain") : nullptr;
        mEntry = reinterpret_cast<PluginMain>(reinterpret_cast<void*>(entry));
        expect(mEntry != nullptr, "the module has an entry point");
    }
    ~Module() { FreeLibrary(mModule); }
    Module(const Module&) = delete;
    Module& operator=(const Module&) = delete;

    std::int16_t call(std::int16_t selector, void* record) const {
        std::int16_t result = 1;
        std::intptr_t data = 0;
        mEntry(selector, record, &data, &result);
        return result;
    }

    /// The property list as a host finds it: of this type, number and language.
    std::string propertyList() const {
        HRSRC found = FindResourceExA(mModule, "PiPL", MAKEINTRESOURCEA(16000), MAKELANGID(LANG_ENGLISH, 1));
        if (!found)
            return {};
        const void* bytes = LockResource(LoadResource(mModule, found));
        return {static_cast<const char*>(bytes), SizeofResource(mModule, found)};
    }

private:
    HMODULE mModule;
    PluginMain mEntry = nullptr;
};

bool isLoaded(const wchar_t* file) {
    return GetModuleHandleW(file) != nullptr;
}

void runFilter(const Module& module, int depth) {
    const Run before(depth);
    Run run(depth);
    expect(module.call(2, run.record.bytes()) == 0, "prepare");
    expect(run.record.get<std::int32_t>(kBufferSpace) == 500'000, "the space that prepare asks for");
    expect(module.call(3, run.record.bytes()) == 0, "start");
    expect(run.requests == 10, "three bands of each plane and the end");
    expect(run.isInverseOf(before),
           "the picture is inverted within the area, at " + std::to_string(depth) + " bits");
}

void callSelectors(const Module& module) {
    void* window = nullptr;
    std::vector<void*> about(256 / sizeof(void*) + 2);
    about[0] = &window;
    expect(module.call(0, about.data()) == 0, "about");
    window = &window;
    expect(module.call(0, about.data()) == -128,
           "a failure inside becomes a code and does not leave the module");
    Run run(8);
    expect(module.call(9, run.record.bytes()) == -30100, "a selector that there is not");
    expect(module.call(1, run.record.bytes()) == 0, "parameters");
    std::printf("file: %.*s\n", int{run.text[0]}, reinterpret_cast<const char*>(run.text) + 1);
}

void printHex(const std::string& bytes) {
    std::printf("properties: ");
    for (const unsigned char byte : bytes)
        std::printf("%02x", byte);
    std::printf("\n");
}

} // namespace

int wmain(int count, wchar_t** arguments) {
    if (count != 2)
        return 2;
    for (int time = 0; time < 2; ++time) {
        {
            const Module module(arguments[1]);
            if (gFailures > 0)
                return 1;
            callSelectors(module);
            printHex(module.propertyList());
            runFilter(module, 8);
            runFilter(module, 16);
        }
        expect(!isLoaded(arguments[1]), "the module goes when it is not needed any more");
    }
    {
        const Module module(arguments[1]);
        Run run(8);
        expect(module.call(5, run.record.bytes()) == 0, "finish");
    }
    expect(isLoaded(arguments[1]), "a pinned module stays");
    return gFailures > 0 ? 1 : 0;
}
