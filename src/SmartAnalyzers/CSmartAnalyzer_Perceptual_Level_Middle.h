#pragma once

#include "SmartAnalyzers/ISmartAnalyzer.h"

/// Derives how much the perceptual middle level and gamma may darken or brighten: the shares of dark tones
/// after a darkening curve and of light tones after a brightening one.
class CSmartAnalyzer_Perceptual_Level_Middle final : public ISmartAnalyzer {
public:
    using ISmartAnalyzer::ISmartAnalyzer;

protected:
    void Prepare() override {}
    void Analyze() override;

private:
    void storeMainFactors();
    void storeTouchFactors();
};
