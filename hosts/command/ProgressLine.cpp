#include "command/ProgressLine.h"

#include <sys/ioctl.h>
#include <unistd.h>

#include <algorithm>
#include <cmath>
#include <cstdio>

namespace orvela {

namespace {

constexpr qint64 kShowMilliseconds = 50;    // a faster line only flickers
constexpr qint64 kSettleMilliseconds = 500; // before that an estimate is a guess

int terminalWidth() {
    winsize size = {};
    return ioctl(STDERR_FILENO, TIOCGWINSZ, &size) == 0 && size.ws_col > 0 ? size.ws_col : 80;
}

} // namespace

ProgressLine::ProgressLine(int photographs, bool wanted)
    : mPhotographs(photographs), mActive(wanted && isatty(STDERR_FILENO)) {
    mSinceStart.start();
    mSinceShown.start();
}

ProgressLine::~ProgressLine() {
    clear();
}

void ProgressLine::begin(const QString& photograph) {
    ++mCurrent;
    mPhotograph = photograph;
    page(0, 1);
}

void ProgressLine::page(int page, int pages) {
    mPage = page;
    mPages = pages;
    step(0, 1, QStringLiteral("Reading"));
    mStepShare = 0;
}

void ProgressLine::step(int step, int total, const QString& name) {
    mStep = name.trimmed();
    mStepStart = std::min(1.0, static_cast<double>(step) / total);
    mStepShare = 1.0 / total;
    mPercent = 0;
    show();
}

void ProgressLine::percent(int percent) {
    mPercent = percent;
    if (mSinceShown.hasExpired(kShowMilliseconds))
        show();
}

void ProgressLine::clear() {
    if (mShown)
        std::fputs("\r\x1b[K", stderr);
    mShown = false;
}

double ProgressLine::doneShare() const {
    return (mPage + std::min(1.0, mStepStart + mStepShare * mPercent / 100)) / mPages;
}

QString ProgressLine::timeLeft() const {
    const double done = mCurrent - 1 + doneShare();
    if (!mSinceStart.hasExpired(kSettleMilliseconds) || done <= 0)
        return {};
    const double seconds = static_cast<double>(mSinceStart.elapsed()) / 1000 * (mPhotographs - done) / done;
    const auto whole = static_cast<int>(std::lround(seconds));
    return QStringLiteral("  %1:%2 left").arg(whole / 60).arg(whole % 60, 2, 10, QLatin1Char('0'));
}

void ProgressLine::show() {
    if (!mActive)
        return;
    const QString page =
        mPages > 1 ? QStringLiteral("  page %1 of %2").arg(mPage + 1).arg(mPages) : QString();
    const QString line =
        QStringLiteral("[%1/%2] %3  %4  %5 %%6")
            .arg(QString::number(mCurrent), QString::number(mPhotographs), mPhotograph + page, mStep,
                 QString::number(static_cast<int>(doneShare() * 100)), timeLeft());
    std::fprintf(stderr, "\r\x1b[K%s", qUtf8Printable(line.left(terminalWidth() - 1)));
    std::fflush(stderr);
    mShown = true;
    mSinceShown.start();
}

} // namespace orvela
