#pragma once

#include <cstddef>

namespace orvela {

/// While it lives, array allocations of the form that reports a failure as null fail as told, on every
/// thread. One at a time.
class FailingArrays {
public:
    static constexpr std::size_t kAnySize = 0;

    /// @param size  bytes of the arrays that fail, or any
    /// @param had   how many of them can still be had
    explicit FailingArrays(std::size_t size, int had = 0);
    ~FailingArrays();
    FailingArrays(const FailingArrays&) = delete;
    FailingArrays& operator=(const FailingArrays&) = delete;
};

} // namespace orvela
