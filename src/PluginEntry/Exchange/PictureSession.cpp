#include "PluginEntry/Exchange/PictureSession.h"

#include "Utility/CGenericEx.h"
#include "Utility/Logger.h"

namespace orvela {

namespace {

// A step of the session: its failure gets the step's text and keeps its cause.
template <typename Step>
void guarded(const char* text, int line, Step step) {
    try {
        step();
    } catch (...) {
        std::throw_with_nested(CGenericEx(QString::fromLatin1(text), "PluginMain", line));
    }
}

void logStep(const char* text) {
    Log::log(LogLevel::Debug, "%s", text);
}

} // namespace

PictureSession::PictureSession(host::FilterRecord* record, std::int16_t* result)
    : mRecord(record), mResult(result) {
    read();
    logStep("Creating Output CARGBPlanePhotoshop...");
    guarded("Unable to instantiate the Output CARGBPlanePhotoshop.", __LINE__, [this] {
        mOutput = std::make_unique<CARGBPlanePhotoshop>(*mInput, QStringLiteral("PluginMain pOutPlane"));
    });
    mProxy = std::make_unique<CARGBPlaneProxyDirect>(*mInput);
}

void PictureSession::read() {
    logStep("Creating Input CARGBPlanePhotoshop...");
    guarded("Unable to instantiate the Input CARGBPlanePhotoshop.", __LINE__, [this] {
        mInput = std::make_unique<CARGBPlanePhotoshop>(0, 0, QStringLiteral("PluginMain pInPlane"));
    });
    logStep("Now filling input plane from Photoshop data...");
    guarded("Unable to fill the CARGBPlanePhotoshop from Photoshop data.", __LINE__,
            [this] { mInput->FillFrom_Photoshop_Data(mRecord, mResult); });
    Log::log(LogLevel::Debug, "pInPlane w=%d h=%d", mInput->width(), mInput->height());
}

void PictureSession::prepare(CThreadedCore& core, const CUserParamsPhotoshop& params) const {
    core.setProxy(mProxy.get());
    core.setParams(params);
}

void PictureSession::writeBack() {
    mInput.reset();
    logStep("Now outputting the result from CARGBPlanePhotoshop to Photoshop...");
    guarded("An error occurred while outputting the result.", __LINE__,
            [this] { mOutput->copyPlaneToPS(mRecord, mResult); });
}

} // namespace orvela
