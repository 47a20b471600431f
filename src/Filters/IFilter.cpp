#include "Filters/IFilter.h"

#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Utility/Assertion.h"
#include "Utility/CGenericEx.h"
#include "Utility/Logger.h"

#include <QDir>

#include <algorithm>
#include <atomic>
#include <utility>

using namespace orvela;

namespace {

constexpr char kSource[] = "Filters/IFilter";

// Numbered over all runs of the process, so that no run overwrites the files of another.
void dumpAfter(const char* task, const CARGBPlane& plane) {
    static std::atomic<unsigned> counter = 0;
    const QString file = QStringLiteral("image_after_%1_%2_%3x%4.raw")
                             .arg(QString::fromLatin1(task))
                             .arg(counter++)
                             .arg(plane.width())
                             .arg(plane.height());
    const QString path = qEnvironmentVariable("TEMP") + QDir::separator() + file;
    plane.dumpToRaw(path.toLocal8Bit());
}

} // namespace

IFilter::IFilter(const RunContext& context, CUserParams* params, CARGBPlane* inPlane, CARGBPlane* outPlane)
    : TaskBase(context, params, inPlane), mOutPlane(outPlane) {
    if (!params) {
        Log::log(LogLevel::Error, "The User Settings object was invalid.");
        throw CBadPtrEx(QStringLiteral(QT_TRANSLATE_NOOP("Failure", "The User Settings object was invalid.")),
                        kSource, 31);
    }
    if (!outPlane) {
        Log::log(LogLevel::Error, "The Output plane was invalid!");
        throw CBadPtrEx(
            QStringLiteral(QT_TRANSLATE_NOOP("Failure", "The filter has an invalid Output plane.")), kSource,
            41);
    }
}

void IFilter::onPass() {
    if (description().writes == Writes::Nothing)
        return;
    const auto height = static_cast<std::uint32_t>(mInPlane->height());
    keepRows(0, std::min(mVertStart, height));
    keepRows(std::min(passEnd(), height), height);
}

void IFilter::onRow(std::uint32_t row) {
    if (description().writes == Writes::SomePixels)
        keepRows(row, row + 1);
}

void IFilter::keepRows(std::uint32_t first, std::uint32_t last) {
    for (std::uint32_t y = first; y < last; ++y) {
        const ConstRow from = std::as_const(*mInPlane).row(static_cast<int>(y));
        const Row to = mOutPlane->row(static_cast<int>(y));
        for (std::size_t c = 0; c < to.size(); ++c)
            std::copy_n(from[c], mInPlane->width(), to[c]);
    }
}

void IFilter::onSuccess() {
    Log::log(LogLevel::Debug, "onSuccess copying from out to in");
    const bool writes = description().writes != Writes::Nothing;
    // First, so that a dump that fails leaves the input as it was.
    if (mContext.dumpsPictures)
        dumpAfter(description().dumpName, writes ? *mOutPlane : *mInPlane);
    if (writes)
        mInPlane->swapSamples(*mOutPlane);
}

void IFilter::onStopped() {
    mOutPlane->copyFrom(*mInPlane);
}

void IFilter::useHostPicture() {
    const CARGBPlaneProxy* proxy = mContext.proxy ? mContext.proxy : CARGBPlaneProxy::current();
    const auto* direct = dynamic_cast<const CARGBPlaneProxyDirect*>(proxy);
    require(direct != nullptr, "IFilter::GetRGBFromHost",
            QT_TRANSLATE_NOOP("Failure", "This version of GetRGBFromHost requires direct proxy."), kSource,
            89);
    mHostPicture = &direct->plane();
}

void IFilter::GetRGBFromHost(int x, int y, std::uint32_t& r, std::uint32_t& g, std::uint32_t& b) const {
    r = mHostPicture->red(x, y);
    g = mHostPicture->green(x, y);
    b = mHostPicture->blue(x, y);
}
