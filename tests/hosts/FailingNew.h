#pragma once

#include <cstddef>
#include <functional>

namespace orvela {

/// While it lives, the n-th allocation by operator new of at least so many bytes does what it is told
/// instead, on whatever thread; the others succeed. One at a time. Of small ones libraries do not survive
/// every failure.
class FailingNew {
public:
    FailingNew(std::size_t size, long n, std::function<void()> failure);
    ~FailingNew();
    FailingNew(const FailingNew&) = delete;
    FailingNew& operator=(const FailingNew&) = delete;

    /// Whether that allocation was asked for.
    static bool happened();
};

} // namespace orvela
