#pragma once

#include "SmartAnalyzers/ISmartAnalyzer.h"

/// Derives where the perceptual light level ends: the share of the tones that do not reach the right end of
/// the histogram once it is stretched.
class CSmartAnalyzer_Perceptual_Level_Right final : public ISmartAnalyzer {
public:
    using ISmartAnalyzer::ISmartAnalyzer;

protected:
    void Prepare() override {}
    void Analyze() override;

private:
    void storeMainFactors();
    void storeTouchFactors();
    int recountLimit();
};
