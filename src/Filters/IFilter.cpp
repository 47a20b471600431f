#include "Filters/IFilter.h"

#include "Library/Utility/CARGBPlaneProxyDirect.h"
#include "Utility/CGenericEx.h"
#include "Utility/Logger.h"

#include <QDir>
#include <QSettings>

#include <atomic>

using namespace orvela;

namespace {

constexpr char kSource[] = "Filters/IFilter";

void dumpAfter(const QByteArray& task, const CARGBPlane& plane) {
    static std::atomic<unsigned> counter = 0;
    const QString file = QStringLiteral("image_after_%1_%2_%3x%4.raw")
                             .arg(QString::fromLatin1(task))
                             .arg(counter++)
                             .arg(plane.width())
                             .arg(plane.height());
    const QString path = qEnvironmentVariable("TEMP") + QDir::separator() + file;
    plane.dumpToRaw(path.toLocal8Bit());
}

const CARGBPlane& hostPlane() {
    const auto* direct = dynamic_cast<const CARGBPlaneProxyDirect*>(CARGBPlaneProxy::current());
    if (!direct)
        qt_assert_x("IFilter::GetRGBFromHost", "This version of GetRGBFromHost requires direct proxy.",
                    kSource, 89);
    return direct->plane();
}

} // namespace

IFilter::IFilter(CUserParams* params, CARGBPlane* inPlane, CARGBPlane* outPlane)
    : mParams(params), mInPlane(inPlane), mOutPlane(outPlane) {
    mVertEnd = inPlane ? static_cast<std::uint32_t>(inPlane->height()) : 0;
    if (!mParams) {
        Log::log(LogLevel::Error, "The User Settings object was invalid.");
        throw CBadPtrEx(QStringLiteral("The User Settings object was invalid."), kSource, 31);
    }
    if (!mOutPlane) {
        Log::log(LogLevel::Error, "The Output plane was invalid!");
        throw CBadPtrEx(QStringLiteral("The filter has an invalid Output plane."), kSource, 41);
    }
}

void IFilter::onSuccess() {
    Log::log(LogLevel::Debug, "onSuccess copying from out to in");
    mInPlane->copyFrom(*mOutPlane);
    if (QSettings().value(QStringLiteral("2000/GUI/dumpImageAfterFile")).toInt() != 0)
        dumpAfter(mName, *mInPlane);
}

void IFilter::onStopped() {
    if (mRowBegun)
        mOutPlane->copyFrom(*mInPlane);
}

void IFilter::GetRGBFromHost(int x, int y, std::uint32_t& r, std::uint32_t& g, std::uint32_t& b) {
    const CARGBPlane& host = hostPlane();
    r = host.red(x, y);
    g = host.green(x, y);
    b = host.blue(x, y);
}

ConstRow IFilter::hostRow(int y) {
    return hostPlane().row(y);
}
