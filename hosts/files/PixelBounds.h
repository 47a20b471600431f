#pragma once

#include "metadata/Bytes.h"

#include <limits>

namespace orvela::bounds {

// How much of a picture one byte of a file can hold at the most, coding by coding: one that claims more is
// damaged, and no memory need be asked for. The bounds are those of the coding, not of what programs write.

/// Nothing is too much: arithmetic coders and those that tell of one colour once.
inline constexpr double kNone = std::numeric_limits<double>::infinity();

// Bytes per byte.
inline constexpr double kLzw = 4096.0 * 8 / 9; ///< a code has 9 bits at least, and stands for 4096 bytes
inline constexpr double kDeflate = 1032;       ///< a match of 258 bytes takes two bits
inline constexpr double kZstd = 131072.0 / 4;  ///< the longest block, of one value: a head and that value
inline constexpr double kLzma = 273 * 8 / 0.3; ///< the longest match: 14 choices, each of 0.022 bits at least

// Pixels per byte.
inline constexpr double kJpeg = 64 * 8;        ///< a block takes a bit at least; not for arithmetic coding
inline constexpr double kHevc = 64.0 * 64 * 8; ///< the largest unit takes a bit that is not coded any further
inline constexpr double kLossyWebp = 16 * 16 * 8 / 3.2; ///< a macroblock's modes have fixed probabilities

/// Pixels per byte of a WebP: without loss one colour takes no bits at all, however large the picture.
double ofWebp(ByteView webp);

} // namespace orvela::bounds
