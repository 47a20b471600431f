#include "GUI/Preview/DraftRunner.h"

#include "Core/CThreadedCore_FinalTouch.h"
#include "Core/CThreadedCore_Orvela.h"
#include "Core/Snapshot.h"
#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Utility/CGenericEx.h"
#include "Utility/Logger.h"

#include <algorithm>
#include <cmath>

namespace orvela {

namespace {

constexpr double kMeasuredPixels = 250'000; // tell of a picture nearly what all its pixels do
constexpr double kMilliseconds = 80;        // for processing a draft: the eye is to have it within 150
constexpr double kFewestPixels = 200'000;   // still tell what a draft is for
constexpr double kMostPixels = 2'000'000;
constexpr double kNearly = 1.4;

using Clock = std::chrono::steady_clock;

} // namespace

DraftRunner::DraftRunner(QObject* parent)
    : QObject(parent), mThread([this](const std::stop_token& stop) { work(stop); }) {
    connect(this, &DraftRunner::made, this, &DraftRunner::tell, Qt::QueuedConnection);
}

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
    mBegun = mCancelled;
    return std::exchange(mWaiting, std::nullopt);
}

void DraftRunner::process(const Request& request) {
    if (const std::shared_ptr<CARGBPlane> draft = draftOf(request))
        Q_EMIT made(draft, request.area, mBegun);
}

// On the thread of the receivers. Of one that was cancelled nothing is told, however far it came.
void DraftRunner::tell(const std::shared_ptr<CARGBPlane>& draft, const QRect& area, int begun) {
    if (begun == mCancelled)
        Q_EMIT done(draft, area);
}

void DraftRunner::prepare(const Request& request) {
    if (mSource.of != request.picture || mSource.area != request.area ||
        mSource.reduction != request.reduction)
        mSource = {request.picture, request.area, request.reduction,
                   takeSnapshot(*request.picture, request.area, request.reduction),
                   takeSnapshot(*request.host, request.area, request.reduction)};
    if (mTapeOf.first != request.picture || mTapeOf.second != request.tape) {
        mTapeOf = {request.picture, request.tape};
        mTape = request.tape ? std::optional(*request.tape) : std::nullopt;
    }
}

std::shared_ptr<CARGBPlane> DraftRunner::draftOf(const Request& request) {
    prepare(request);
    bool missed = false;
    if (mTape) {
        auto draft = play(request, missed);
        if (!draft || !missed)
            return draft;
    }
    return measure(request) ? play(request, missed) : nullptr;
}

// `missed` tells whether these settings need what the tape does not hold.
std::shared_ptr<CARGBPlane> DraftRunner::play(const Request& request, bool& missed) {
    const auto start = Clock::now();
    MeasurementTape played = *mTape;
    auto draft = run(request, *mSource.picture, *mSource.host,
                     [&played](CThreadedCore& core) { core.playTape(played); });
    missed = played.hasMissed();
    if (draft)
        mPixelsAtOnce =
            pixelsAtOnce(mPixelsAtOnce, static_cast<double>(draft->pixelCount()), Clock::now() - start);
    return draft;
}

double DraftRunner::pixelsAtOnce(double before, double pixels,
                                 std::chrono::duration<double, std::milli> spent) {
    const double now = std::clamp(pixels * kMilliseconds / spent.count(), kFewestPixels, kMostPixels);
    return now < before / kNearly || now > before * kNearly ? now : before;
}

// These settings need what no run has measured: a small copy of the whole picture tells it nearly.
bool DraftRunner::measure(const Request& request) {
    const CARGBPlane& picture = *request.picture;
    const QRect whole(0, 0, picture.width(), picture.height());
    const auto reduction = static_cast<int>(std::ceil(std::sqrt(picture.pixelCount() / kMeasuredPixels)));
    mTapeOf = {};
    mTape.emplace();
    if (!run(request, *takeSnapshot(picture, whole, reduction),
             *takeSnapshot(*request.host, whole, reduction),
             [this](CThreadedCore& core) { core.recordTape(&*mTape); }))
        return false;
    mTapeOf = {request.picture, request.tape};
    return true;
}

std::shared_ptr<CARGBPlane> DraftRunner::run(const Request& request, const CARGBPlane& picture,
                                             const CARGBPlane& host,
                                             const std::function<void(CThreadedCore&)>& setUp) {
    CARGBPlane input(picture, QStringLiteral("Draft input"));
    auto output = std::make_shared<CARGBPlane>(picture, QStringLiteral("Draft output"));
    const CARGBPlaneProxyDirect proxy(host, CARGBPlaneProxyDirect::Private);
    std::unique_ptr<CThreadedCore> core;
    if (request.finalTouch)
        core = std::make_unique<CThreadedCore_FinalTouch>(&input, output.get());
    else
        core = std::make_unique<CThreadedCore_Orvela>(&input, output.get());
    connect(core.get(), &CThreadedCore::stepDone, core.get(), [&core] { core->stepHandled(); });
    core->setProxy(&proxy);
    core->setParams(request.params);
    setUp(*core);
    {
        const std::scoped_lock lock(mMutex);
        if (mBegun != mCancelled)
            return nullptr;
        mCore = core.get();
    }
    core->run();
    const std::scoped_lock lock(mMutex);
    mCore = nullptr;
    return core->lastProcessingDone() && mBegun == mCancelled ? output : nullptr;
}

} // namespace orvela
