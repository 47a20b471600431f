#pragma once

#include "SmartAnalyzers/ISmartAnalyzer.h"

/// Derives how far the perceptual brightness may lift or lower the tones and how much contrast they bear,
/// from the masses of highlights and shadows. Idle without a perceptual contrast or brightness switch.
class CSmartAnalyzer_Perceptual_Contrast_Brightness final : public ISmartAnalyzer {
public:
    using ISmartAnalyzer::ISmartAnalyzer;

protected:
    void Prepare() override {}
    void Analyze() override;

private:
    void storeBrightnessFactors();
    void storeContrastFactors();
    bool lifts() const;
};
