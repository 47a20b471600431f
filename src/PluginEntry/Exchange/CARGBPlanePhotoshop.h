#pragma once

#include "Platform/FilterRecord.h"
#include "Utility/CARGBPlane.h"

/// A plane that fills itself from the host's image and writes itself back: images of one to four channels, 8
/// or 16 bits each, mapped to 8-bit red, green and blue. Always the whole filter rectangle, one channel at a
/// time. A fourth channel is neither read nor written; any three-channel colour model passes as red, green
/// and blue.
class CARGBPlanePhotoshop final : public CARGBPlane {
public:
    using CARGBPlane::CARGBPlane;

    /// Takes the size of the filter rectangle and reads up to three channels. 16-bit samples (0 to 32768,
    /// larger ones count as 32768) become floor(s * 255 / 32768); depths other than 8 and 16 transfer no
    /// samples.
    /// @param result  the host's result cell; receives every code that the host returns
    /// @throws CGenericEx when the host refuses a request or has no buffer for it
    void FillFrom_Photoshop_Data(orvela::host::FilterRecord* record, std::int16_t* result);

    /// Writes the channels back: red, green and blue; red alone to a single channel; blue to grey with
    /// transparency, whose transparency becomes opaque.
    /// @throws CGenericEx when the host refuses a request, has no buffer for it, or none of one to four
    ///         channels
    void copyPlaneToPS(orvela::host::FilterRecord* record, std::int16_t* result);

private:
    void takeShape(const orvela::host::FilterRecord* record);
    void writeChannel(int channel, const std::uint8_t* samples, orvela::host::FilterRecord* record,
                      std::int16_t* result);
    void copyToOutput(orvela::host::FilterRecord* record, const std::uint8_t* samples) const;
    void copyFromInput(const orvela::host::FilterRecord* record, std::uint8_t* samples) const;
    void writeOpaque(int channel, orvela::host::FilterRecord* record, std::int16_t* result);
};
