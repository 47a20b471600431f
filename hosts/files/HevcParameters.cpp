#include "files/HevcParameters.h"

namespace orvela {

namespace {

constexpr std::uint64_t kPictureParameters = 34; // kind of unit

/// Takes bits off the front, the most significant of a byte first.
class Bits {
public:
    explicit Bits(Bytes bytes) : mBytes(std::move(bytes)) {}

    unsigned take(int count) {
        unsigned value = 0;
        for (; count > 0; --count, ++mAt) {
            const std::uint64_t byte = number(mBytes, mAt / 8, 1, ByteOrder::Big);
            value = value << 1 | static_cast<unsigned>(byte >> (7 - mAt % 8) & 1);
        }
        return value;
    }
    bool flag() { return take(1) != 0; }

    // A number by exponential Golomb coding, whose value does not matter here.
    void skipGolomb() {
        int zeros = 0;
        while (!flag())
            ++zeros;
        mAt += static_cast<std::size_t>(zeros);
    }

private:
    Bytes mBytes;
    std::size_t mAt = 0;
};

// Behind two zeros a three stands only so that no start code appears.
Bytes withoutGuards(ByteView unit) {
    Bytes bytes;
    int zeros = 0;
    for (const std::uint8_t byte : unit) {
        const bool guard = zeros >= 2 && byte == 3;
        zeros = byte == 0 ? zeros + 1 : 0;
        if (!guard)
            bytes.push_back(byte);
    }
    return bytes;
}

// Up to transquant_bypass_enabled_flag, ITU-T H.265, 7.3.2.3.1.
bool bypassesQuantization(ByteView unit) {
    Bits bits(withoutGuards(unit));
    bits.skipGolomb(); // its own number
    bits.skipGolomb(); // that of the sequence's parameters
    bits.take(2 + 3 + 2);
    for (int i = 0; i < 3; ++i)
        bits.skipGolomb(); // references, the first step of quantization
    bits.take(2);
    if (bits.flag())
        bits.skipGolomb(); // how deep the step changes
    bits.skipGolomb();     // steps of both colours
    bits.skipGolomb();
    bits.take(3);
    return bits.flag();
}

} // namespace

bool isLosslessHevc(ByteView configuration) {
    constexpr std::size_t head = 22;
    constexpr std::size_t unitHead = 2;
    try {
        Cursor cursor(configuration);
        cursor.take(head);
        for (std::uint64_t arrays = cursor.number(1); arrays > 0; --arrays) {
            const std::uint64_t kind = cursor.number(1) & 0x3F;
            for (std::uint64_t units = cursor.number(2); units > 0; --units) {
                Cursor unit(cursor.take(cursor.number(2)));
                unit.take(unitHead);
                if (kind == kPictureParameters && bypassesQuantization(unit.rest()))
                    return true;
            }
        }
    } catch (const DamagedBytes&) {
        // Then the decoder refuses the picture, or knows better.
    }
    return false;
}

} // namespace orvela
