#pragma once

#include "SmartAnalyzers/ISmartAnalyzer.h"

/// Derives the limits of the digital flash from the shares of highlights and shadows once the tones are
/// spread away from the mean luma. Idle without the digital flash.
class CSmartAnalyzer_Digital_Flash final : public ISmartAnalyzer {
public:
    using ISmartAnalyzer::ISmartAnalyzer;

protected:
    void Prepare() override {}
    void Analyze() override;
};
