#pragma once

#include "Settings/CSliderParams.h"
#include "Settings/EGUIMode.h"
#include "Settings/SliderScale.h"

#include <QByteArray>
#include <QString>

#include <array>
#include <atomic>
#include <cstdint>
#include <functional>
#include <span>
#include <variant>

namespace orvela {

/// A stop request: written by one thread while others read it. A read that misses the write only delays the
/// stop.
class CancelFlag {
public:
    CancelFlag(bool set = false) : mSet(set) {}
    CancelFlag(const CancelFlag& other) : mSet(bool(other)) {}
    CancelFlag& operator=(const CancelFlag& other) {
        mSet.store(bool(other), std::memory_order_relaxed);
        return *this;
    }
    operator bool() const { return mSet.load(std::memory_order_relaxed); }

private:
    std::atomic<bool> mSet;
};

using Histogram = std::array<double, 256>;

} // namespace orvela

/// Everything that one processing run needs and produces: slider values, hooks, picture flags, statistics and
/// the factors that measurements hand to filters. Built for each run, copied into the core and changed by its
/// tasks.
class CUserParams {
public:
    /// All fields as after reset().
    CUserParams();
    virtual ~CUserParams() = default;
    CUserParams(const CUserParams&) = default;
    CUserParams& operator=(const CUserParams&) = default;

    /// Sliders 0 and off, hooks gone, flags and statistics at their defaults. Leaves m_Opaco and the
    /// per-channel midtone and highlight factors as they are.
    virtual void reset();

    /// Writes the four histograms as tab-separated text, one line per bin below a header. A file that cannot
    /// be opened is skipped silently.
    virtual void writeHistograms(const QByteArray& path) const;

    /// Lists the fields to the log at the debug level, under `name`.
    void list(const QString& name) const;

    /// Reports the percentage (0 to 100) of the current task; may be called from any thread.
    std::function<void(std::int32_t percent)> mProgressCallback;
    orvela::CancelFlag mCancelRequested;
    bool Final_Touch_Mode_Enabled = false;
    CSliderParams mSliderParams;

#define ORVELA_STATISTIC_FIELD(type, name, start, listed, meaning, low, high, writer) type name = start;
#define ORVELA_KEPT_FIELD(type, name, meaning, low, high, writer) type name = {};
#include "Settings/StatisticFields.inc"

    orvela::Histogram pHisto_Luma = {};
    orvela::Histogram pHisto_Red = {};
    orvela::Histogram pHisto_Green = {};
    orvela::Histogram pHisto_Blue = {};
};

namespace orvela {

/// One picture flag, statistic or derived factor of CUserParams.
struct StatisticField {
    using Member = std::variant<bool CUserParams::*, std::int32_t CUserParams::*, float CUserParams::*,
                                double CUserParams::*>;

    const char* name;
    Member member;
    int listed; ///< position among the lines of the listing, 0 when it has none
    const char* meaning;
    double low;         ///< lowest value
    double high;        ///< highest value; infinite when there is none
    const char* writer; ///< class names of the tasks that write it, between commas; empty when none does

    /// Flags are 0 and 1.
    double valueIn(const CUserParams& params) const;
    void setIn(CUserParams& params, double value) const;
};

/// All of them, in order.
std::span<const StatisticField> statisticFields();

/// The single slider that a single-filter mode shows.
struct GenericSlider {
    float CSliderParams::*field = nullptr; ///< field that it drives; null outside those modes
    QString label;
    std::int32_t scheme = 0; ///< number of the set of track colours
    float low = 0;           ///< shown number at position 0
    float high = 0;          ///< shown number at position 1000
    const SliderScale* scale = nullptr;
};

} // namespace orvela

class CUserParamsPhotoshop : public CUserParams {
public:
    CUserParamsPhotoshop() = default;

    /// The factory settings of `mode`. A value without settings of its own gives a debug box and a reset
    /// object.
    explicit CUserParamsPhotoshop(EGUIMode mode);

    orvela::GenericSlider mGenericSlider;
};
