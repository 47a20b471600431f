#pragma once

#include "Filters/TaskBase.h"

#include <atomic>

/// A task that reads its input plane and writes the same rows of its output plane. On success the output
/// becomes the input, so that the next filter of a chain reads the result from the same plane; a pixel that a
/// filter does not write keeps what the output plane holds, which is the input's.
class IFilter : public TaskBase {
public:
    /// The pointers are not owned.
    /// @throws CBadPtrEx without params or without an output plane
    IFilter(CUserParams* params, CARGBPlane* inPlane, CARGBPlane* outPlane);

protected:
    /// Copies the output into the input; dumps it when the settings ask for it.
    void onSuccess() override;
    /// Puts the input back into the output if a row was begun, so that no half-written picture shows through.
    void onStopped() override;

    /// The unprocessed host pixel at column x, row y. Needs a direct plane proxy.
    static void GetRGBFromHost(int x, int y, std::uint32_t& r, std::uint32_t& g, std::uint32_t& b);
    /// The same for a whole row.
    static orvela::ConstRow hostRow(int y);

    /// The row prelude (see beginRow) of this filter.
    void beginRow(std::uint32_t row, const char* source, int line) {
        ::beginRow(*mParams, *mInPlane, row, source, line);
        mRowBegun.store(true, std::memory_order_relaxed);
    }

    CUserParams* mParams;
    CARGBPlane* mInPlane;
    CARGBPlane* mOutPlane;

private:
    std::atomic<bool> mRowBegun = false;
};
