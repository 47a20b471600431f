#pragma once

#include "Core/CThreadedCore.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Platform/FilterRecord.h"
#include "PluginEntry/Exchange/CARGBPlanePhotoshop.h"

#include <memory>

namespace orvela {

/// The planes of one start of the filter over a host's picture, from reading to writing back. Its copy of the
/// unprocessed picture is the process-wide plane proxy until another session is made or this one ends.
class PictureSession {
public:
    /// Reads the picture.
    /// @param record, result  the host's filter record and result cell; the cell receives every code that the
    ///                        host returns
    /// @throws CGenericEx with the failed step's text and its cause nested
    PictureSession(host::FilterRecord* record, std::int16_t* result);

    /// The picture that the runs work on, and what they hand on; both hold the result after a run.
    CARGBPlane& input() { return *mInput; }
    CARGBPlane& output() { return *mOutput; }

    /// Readies `core`, which works on both planes, for a run with these parameters over this picture; its
    /// reports will tell what became of it.
    void prepare(CThreadedCore& core, const CUserParamsPhotoshop& params) const;

    /// Hands the output to the host; there is no input any more then.
    /// @throws CGenericEx as the constructor
    void writeBack();

private:
    void read();

    host::FilterRecord* mRecord;
    std::int16_t* mResult;
    std::unique_ptr<CARGBPlanePhotoshop> mInput;
    std::unique_ptr<CARGBPlaneProxyDirect> mProxy;
    std::unique_ptr<CARGBPlanePhotoshop> mOutput;
};

} // namespace orvela
