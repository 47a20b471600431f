#pragma once

#include "common/ImageHost.h"

/// A host of its own two copies of a photograph, and one that refuses a request on demand.
class HostedPicture {
public:
    explicit HostedPicture(const orvela::Photograph& photograph)
        : source(photograph), result(photograph),
          host(orvela::shapeOf(source), source.samples, result.samples) {}

    orvela::host::FilterRecord& record() { return host.record(); }

    /// Makes the n-th advanceState from now (1: the next) of the only living object return `code`.
    void failAt(int n, std::int16_t code) {
        sLeft = n;
        sCode = code;
        sAdvance = record().advanceState;
        record().advanceState = []() -> std::int16_t { return --sLeft == 0 ? sCode : sAdvance(); };
    }

    const orvela::Photograph source;
    orvela::Photograph result;
    orvela::ImageHost host;

private:
    static inline int sLeft = 0;
    static inline std::int16_t sCode = 0;
    static inline orvela::host::AdvanceStateProc sAdvance = nullptr;
};
