#pragma once

#include <stdexcept>
#include <string>

namespace orvela {

/// The most that a task may take of a picture of 24 megapixels on two threads, in multiples of P, a plain
/// row-parallel copy of three planes.
struct Bar {
    const char* task; ///< class name
    double multiplesOfP;
};

inline constexpr Bar kBars[] = {
    // curves of one channel value
    {"Auto_Gamma", 1.6},
    {"CGamma_Simple_Filter", 1.6},
    {"CGamma_Perceptual", 1.6},
    {"CAuto_Color", 1.6},
    {"Auto_Contrast", 1.6},
    {"CContrast_Simple_Filter", 1.6},
    // curves that keep the hue, with and without the host's pixels
    {"CAuto_Contrast_TEST", 2.5},
    {"CAuto_Contrast_TEST_II", 2.5},
    {"CClarity", 2.5},
    {"CLevel_Middle", 2.5},
    {"CAuto_Contrast_I", 2.5},
    {"Super_ORV_II", 3},
    // tables of the value and the pixel's sum
    {"CLevel_Dark_Left", 6},
    {"CLevel_Light_Right", 6},
    {"CLevel_Dark_Left_Perceptual", 6},
    {"CLevel_Middle_Perceptual", 6},
    {"CLevel_Light_Right_Perceptual", 6},
    {"CContrast_Brightness_Perceptual", 5.5},
    {"CDigital_Flash_Perceptual", 5.5},
    {"CSpecial_Contrast_Perceptual", 5.5},
    // colour
    {"Saturation", 10},
    {"CTemperature", 7},
    {"CColor", 7},
    // neighbourhoods
    {"CBilinear", 25},
    {"Super_ORV", 27},
    {"COrv_I_Iter", 7.5},
    {"COrv_II_Iter", 7.5},
    {"CMedian_Salt_Pepper", 7},
    {"CMoire", 14},
    // measurements: of every pixel, of samples, of the histograms; and the empty filter
    {"CHistogram_Luma_Final", 6},
    {"CHistogram0", 0.5},
    {"CHistogram_III", 0.5},
    {"CHistogram_IV", 0.5},
    {"CHistogram_VII", 0.5},
    {"CHistogram_VIII", 0.5},
    {"CHistogram_Luma_after_Orv", 0.5},
    {"Sharp_Smart", 0.5},
    {"CSmartAnalyzer_Digital_Flash", 0.5},
    {"CSmartAnalyzer_Perceptual_Contrast_Brightness", 0.5},
    {"CSmartAnalyzer_Perceptual_Level_Dark", 0.5},
    {"CSmartAnalyzer_Perceptual_Level_Middle", 0.5},
    {"CSmartAnalyzer_Perceptual_Level_Right", 0.5},
    {"CAverage", 0.5},
};

/// The bar of a task, in multiples of P.
/// @throws std::invalid_argument when the task has none
inline double barOf(const std::string& task) {
    for (const Bar& bar : kBars) {
        if (bar.task == task)
            return bar.multiplesOfP;
    }
    throw std::invalid_argument(task + " has no bar; give it one in bench/Bars.h");
}

} // namespace orvela
