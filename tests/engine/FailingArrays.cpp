#include "support/FailingArrays.h"

#include <atomic>
#include <new>

namespace {

std::atomic<bool> gFails = false;
std::size_t gSize = 0;
std::atomic<int> gHad = 0;

} // namespace

// The form of allocation that reports a failure as null.
void* operator new[](std::size_t size, const std::nothrow_t&) noexcept {
    if (gFails && (gSize == size || gSize == orvela::FailingArrays::kAnySize) && gHad-- <= 0)
        return nullptr;
    try {
        return ::operator new[](size);
    } catch (const std::bad_alloc&) {
        return nullptr;
    }
}

namespace orvela {

FailingArrays::FailingArrays(std::size_t size, int had) {
    gSize = size;
    gHad = had;
    gFails = true;
}

FailingArrays::~FailingArrays() {
    gFails = false;
}

} // namespace orvela
