#pragma once

#include "SmartAnalyzers/ISmartAnalyzer.h"

/// Derives how much the perceptual dark level lifts: the share of the tones that stay near the left end of
/// the histogram once the shadows are pulled down, in percent (final touch: times 200, for each channel).
class CSmartAnalyzer_Perceptual_Level_Dark final : public ISmartAnalyzer {
public:
    using ISmartAnalyzer::ISmartAnalyzer;

protected:
    void Prepare() override {}
    void Analyze() override;

private:
    void storeMainFactors();
    void storeTouchFactors();
    int recountCenter();
};
