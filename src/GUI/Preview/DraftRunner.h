#pragma once

#include "Core/CThreadedCore.h"
#include "Filters/MeasurementTape.h"

#include <QObject>
#include <QRect>

#include <atomic>
#include <chrono>
#include <condition_variable>
#include <memory>
#include <mutex>
#include <optional>
#include <thread>

namespace orvela {

/// Processes the part of a picture that is seen, reduced to what the screen shows, while a slider moves. The
/// work is done on a thread of its own, the newest request first and only.
class DraftRunner : public QObject {
    Q_OBJECT

public:
    struct Request {
        std::shared_ptr<const CARGBPlane> picture; ///< that the settings are applied to
        std::shared_ptr<const CARGBPlane> host;    ///< the unprocessed one, of the same size
        QRect area;                                ///< of both
        int reduction = 1;
        CUserParamsPhotoshop params;
        bool finalTouch = false;
        std::shared_ptr<const MeasurementTape> tape; ///< of a run over the whole picture; null for none
    };

    explicit DraftRunner(QObject* parent = nullptr);
    ~DraftRunner() override;

    /// Takes the place of a request that has not begun.
    void request(Request request);

    /// How many pixels a draft may have to be seen at once, as the one before tells: other machines and
    /// settings take other times.
    double pixelsAtOnce() const { return mPixelsAtOnce; }
    /// The same after a draft of so many pixels that took so long; what was known before stays while it is
    /// nearly right, since each other reduction takes the part of the picture anew.
    static double pixelsAtOnce(double before, double pixels, std::chrono::duration<double, std::milli> spent);

    /// Gives up what is under way; nothing is done() of it any more.
    void cancel();

Q_SIGNALS:
    /// The draft of a part, reduced as it was asked for.
    void done(std::shared_ptr<CARGBPlane> draft, QRect area);
    /// For this object itself, from its thread: `begun` says how often was cancelled before.
    void made(std::shared_ptr<CARGBPlane> draft, QRect area, int begun);

private:
    /// The part of the pictures that drafts start from.
    struct Source {
        std::shared_ptr<const CARGBPlane> of;
        QRect area;
        int reduction = 0;
        std::unique_ptr<CARGBPlane> picture;
        std::unique_ptr<CARGBPlane> host;
    };

    void work(const std::stop_token& stop);
    std::optional<Request> next(const std::stop_token& stop);
    void process(const Request& request);
    void tell(const std::shared_ptr<CARGBPlane>& draft, const QRect& area, int begun);
    void prepare(const Request& request);
    std::shared_ptr<CARGBPlane> draftOf(const Request& request);
    std::shared_ptr<CARGBPlane> play(const Request& request, bool& missed);
    bool measure(const Request& request);
    std::shared_ptr<CARGBPlane> run(const Request& request, const CARGBPlane& picture, const CARGBPlane& host,
                                    const std::function<void(CThreadedCore&)>& setUp);

    std::atomic<double> mPixelsAtOnce = 500'000;

    std::mutex mMutex;
    std::condition_variable_any mWoken;
    std::optional<Request> mWaiting;
    CThreadedCore* mCore = nullptr; ///< that works now
    int mCancelled = 0;             ///< how often

    // Of the thread alone.
    int mBegun = 0; ///< mCancelled when the request was taken
    Source mSource;
    std::optional<MeasurementTape> mTape; ///< that is played
    std::pair<std::shared_ptr<const CARGBPlane>, std::shared_ptr<const MeasurementTape>> mTapeOf;

    std::jthread mThread; ///< last: ends before the rest
};

} // namespace orvela
