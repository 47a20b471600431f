#pragma once

#include "Filters/TaskBase.h"

/// A task that reads its input plane and writes the same rows of its output plane. On success the planes
/// exchange their pixels, so that the next filter of a chain reads the result from the same plane; between
/// filters the output plane holds nothing of use.
class IFilter : public TaskBase {
public:
    /// The pointers are not owned.
    /// @throws CBadPtrEx without params or without an output plane
    IFilter(const orvela::RunContext& context, CUserParams* params, CARGBPlane* inPlane,
            CARGBPlane* outPlane);

protected:
    /// Makes the output the input; dumps it when the run asks for it.
    void onSuccess() override;
    /// Copies the rows that the pass leaves out. A filter that writes visits neighbouring rows.
    void onPass() override;
    /// Copies the row if the filter writes only some pixels of it.
    void onRow(std::uint32_t row) override;
    /// Puts the input back into the output, so that no half-written picture shows through.
    void onStopped() override;

    /// Looks the host's picture up, for the two below; to be called in setUp().
    void useHostPicture();
    /// The unprocessed host pixel at column x, row y.
    void GetRGBFromHost(int x, int y, std::uint32_t& r, std::uint32_t& g, std::uint32_t& b) const;
    /// The same for a whole row.
    orvela::ConstRow hostRow(int y) const { return mHostPicture->row(y); }

    orvela::Borrowed<CARGBPlane> mOutPlane;

private:
    const CARGBPlane* outPlane() const final { return mOutPlane.get(); }
    void keepRows(std::uint32_t first, std::uint32_t last);

    const CARGBPlane* mHostPicture = nullptr;
};
