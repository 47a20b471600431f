#pragma once

#include "Settings/CUserParams.h"

#include <array>
#include <optional>

namespace orvela {

/// What the automatic contrast and colour filters share: limits read off 256-bin histograms, and the curves
/// that stretch between them.
namespace TonalStretch {

/// A black and a white limit, channel values 0 to 255.
struct Limits {
    int black = 0;
    int white = 255;

    /// Neither deep shadows nor highlights: white below 215 and black above 40.
    bool isHazy() const { return white < 215 && black > 40; }
};

/// First bin with more than `threshold` samples, counting up from 0 to `last`.
std::optional<int> scanLeft(const Histogram& bins, double threshold, int last);
/// First bin with more than `threshold` samples, counting down from 255 to `last`.
std::optional<int> scanRight(const Histogram& bins, double threshold, int last);

/// Threshold of a first scan: 0.1 * sqrt(pixels) when sqrt(pixels) exceeds 700, else 0.
double baseThreshold(int pixels);

/// The smallest black and the largest white limit.
Limits combine(const std::array<Limits, 3>& channels);

/// The red, green and blue histogram.
std::array<const Histogram*, 3> channelHistograms(const CUserParams& params);

/// Reads the limits off the luma histogram, starting from the given ones, and sets m_Opaco to whether they
/// are hazy; those of a hazy picture are read again.
/// @param threshold      of the first scans
/// @param hazyThreshold  of the scans of a hazy picture; one that finds nothing keeps the first result
/// @return whether the picture is hazy
bool storeHaze(CUserParams& params, Limits& limits, double threshold, double hazyThreshold);

/// Linear stretch of a hazy picture in integers, black to 0 and white to 255, clamped. With equal limits the
/// value is left alone.
int stretchHazy(int value, Limits limits);

/// Soft pull of the shadows, c - (1 - c / 255) * black, not below 0: strongest at 0, nothing at 255.
float pullShadows(float value, float black);
/// Soft lift of the highlights, c + (1 - (255 - c) / 255) * (255 - white), not above 255: nothing at 0,
/// strongest at 255.
float liftHighlights(float value, float white);

} // namespace TonalStretch

} // namespace orvela
