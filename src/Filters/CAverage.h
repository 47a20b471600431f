#pragma once

#include "Filters/IFilter.h"

/// A filter that leaves the picture as it is.
class CAverage : public IFilter {
public:
    using IFilter::IFilter;

    /// Reports the empty filter to the log. Always false: nothing was changed.
    virtual bool ApplyEmpty();

protected:
    const orvela::TaskDescription& description() const override;
};
