#pragma once

#include "Filters/IFilter.h"
#include "Filters/Kernels/PixelRow.h"

#include <utility>

namespace orvela {

/// A filter whose result for a pixel depends on nothing of the picture but that pixel (and the host's
/// unprocessed one). It states how a row is mapped and reads the row from wherever it is handed.
class PointFilter : public IFilter {
public:
    using IFilter::IFilter;

protected:
    /// Maps the pixels of a row; every pixel is written.
    virtual void mapRow(const PixelRow& row) const = 0;

private:
    void ApplyRow(std::uint32_t row) final {
        const int y = static_cast<int>(row);
        mapRow({y, mInPlane->width(), std::as_const(*mInPlane).row(y), mOutPlane->row(y)});
    }
};

} // namespace orvela
