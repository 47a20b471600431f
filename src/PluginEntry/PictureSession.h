#pragma once

#include "Core/CThreadedCore.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Platform/FilterRecord.h"
#include "PluginEntry/CARGBPlanePhotoshop.h"

#include <memory>

namespace orvela {

/// The planes of one start of the filter over a host's picture, from reading to writing back. While it lives,
/// its copy of the unprocessed picture is the process-wide plane proxy.
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

    /// Runs `core`, which works on both planes, with these parameters; see its reports for what became of it.
    /// @param scheduler  null for as many threads as there are processors
    void run(CThreadedCore& core, const CUserParamsPhotoshop& params, RowScheduler* scheduler = nullptr);

    /// Hands the output to the host; there is no input any more then.
    /// @throws CGenericEx as the constructor
    void writeBack();

private:
    void read();

    host::FilterRecord* mRecord;
    std::int16_t* mResult;
    std::unique_ptr<CARGBPlanePhotoshop> mInput;
    std::unique_ptr<CARGBPlanePhotoshop> mOutput;
    std::unique_ptr<CARGBPlaneProxyDirect> mProxy;
};

} // namespace orvela
