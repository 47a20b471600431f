#include "GUI/Preview/DraftRunner.h"

#include "Core/CThreadedCore_FinalTouch.h"
#include "Core/CThreadedCore_Orvela.h"
#include "Core/Snapshot.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Utility/CGenericEx.h"
#include "Utility/Logger.h"

namespace orvela {

DraftRunner::DraftRunner(QObject* parent)
    : QObject(parent), mThread([this](const std::stop_token& stop) { work(stop); }) {}

DraftRunner::~DraftRunner() {
    mThread.request_stop();
    cancel();
    mThread.join();
}

void DraftRunner::request(Request request) {
    const std::scoped_lock lock(mMutex);
    mWaiting = std::move(request);
    mWoken.notify_one();
}

void DraftRunner::cancel() {
    const std::scoped_lock lock(mMutex);
    ++mCancelled;
    mWaiting.reset();
    if (mCore)
        mCore->stop();
}

void DraftRunner::work(const std::stop_token& stop) {
    while (const std::optional<Request> request = next(stop)) {
        try {
            process(*request);
        } catch (const std::exception& error) { // nobody waits for a draft
            Log::log(LogLevel::Warning, "No draft could be made: %s", error.what());
        }
    }
}

std::optional<DraftRunner::Request> DraftRunner::next(const std::stop_token& stop) {
    std::unique_lock lock(mMutex);
    if (!mWoken.wait(lock, stop, [this] { return mWaiting.has_value(); }))
        return std::nullopt;
    return std::exchange(mWaiting, std::nullopt);
}

void DraftRunner::process(const Request& request) {
    int cancelled = 0;
    {
        const std::scoped_lock lock(mMutex);
        cancelled = mCancelled;
    }
    const std::shared_ptr<CARGBPlane> draft = draftOf(request);
    const std::scoped_lock lock(mMutex);
    if (!draft || cancelled != mCancelled)
        return;
    QMetaObject::invokeMethod(this, [this, draft, area = request.area, cancelled] {
        if (cancelled == mCancelled)
            Q_EMIT done(draft, area);
    });
}

void DraftRunner::prepare(const Request& request) {
    if (mSource.of == request.picture && mSource.area == request.area &&
        mSource.reduction == request.reduction)
        return;
    mSource = {request.picture, request.area, request.reduction,
               takeSnapshot(*request.picture, request.area, request.reduction),
               takeSnapshot(*request.host, request.area, request.reduction)};
}

std::shared_ptr<CARGBPlane> DraftRunner::draftOf(const Request& request) {
    prepare(request);
    CARGBPlane input(*mSource.picture, QStringLiteral("Draft input"));
    auto output = std::make_shared<CARGBPlane>(*mSource.picture, QStringLiteral("Draft output"));
    const CARGBPlaneProxyDirect host(*mSource.host, CARGBPlaneProxyDirect::Private);
    std::unique_ptr<CThreadedCore> core;
    if (request.finalTouch)
        core = std::make_unique<CThreadedCore_FinalTouch>(&input, output.get());
    else
        core = std::make_unique<CThreadedCore_Orvela>(&input, output.get());
    connect(core.get(), &CThreadedCore::stepDone, core.get(), [&core] { core->stepHandled(); });
    core->setProxy(&host);
    core->setParams(request.params);
    std::optional<MeasurementTape> tape;
    if (request.tape)
        core->setExcerpt({request.picture->pixelCount(), request.reduction}, &tape.emplace(*request.tape));
    {
        const std::scoped_lock lock(mMutex);
        mCore = core.get();
    }
    core->run();
    const std::scoped_lock lock(mMutex);
    mCore = nullptr;
    return core->lastProcessingDone() ? output : nullptr;
}

} // namespace orvela
