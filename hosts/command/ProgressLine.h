#pragma once

#include <QElapsedTimer>
#include <QString>

namespace orvela {

/// The line on a terminal that tells what is being done: photograph n of m, its name, the step, the
/// percentage of the photograph and the time left for all. Writes nothing when standard error is no terminal.
class ProgressLine {
public:
    /// @param photographs  how many there will be
    /// @param wanted       false keeps the line away in any case
    ProgressLine(int photographs, bool wanted);
    ~ProgressLine();

    /// The next photograph begins.
    void begin(const QString& photograph);

    /// A page of `pages` begins, counted from 0.
    void page(int page, int pages);

    /// A step of `total` begins, counted from 0.
    void step(int step, int total, const QString& name);

    /// Percentage of the current step.
    void percent(int percent);

    /// Takes the line off the terminal, for other output.
    void clear();

private:
    double doneShare() const;
    QString timeLeft() const;
    void show();

    const int mPhotographs;
    const bool mActive;
    int mCurrent = 0;
    int mPage = 0;
    int mPages = 1;
    QString mPhotograph;
    QString mStep;
    double mStepStart = 0; ///< share of the photograph that was done before the step
    double mStepShare = 0;
    int mPercent = 0;
    bool mShown = false;
    QElapsedTimer mSinceStart;
    QElapsedTimer mSinceShown;
};

} // namespace orvela
