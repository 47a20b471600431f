#include "hosts/FailingNew.h"

#include <atomic>
#include <cstdlib>
#include <new>

namespace {

std::atomic<long> gLeft = 0; // 0: none will fail
std::size_t gSize = 0;
std::function<void()> gFailure;
std::atomic<bool> gHappened = false;

} // namespace

void* operator new(std::size_t size) {
    if (size >= gSize && gLeft > 0 && --gLeft == 0) {
        gHappened = true;
        gFailure();
    }
    for (;;) {
        if (void* memory = std::malloc(size > 0 ? size : 1))
            return memory;
        const std::new_handler handler = std::get_new_handler();
        if (handler == nullptr)
            throw std::bad_alloc();
        handler();
    }
}

void operator delete(void* memory) noexcept {
    std::free(memory);
}

void operator delete(void* memory, std::size_t) noexcept {
    std::free(memory);
}

namespace orvela {

FailingNew::FailingNew(std::size_t size, long n, std::function<void()> failure) {
    gSize = size;
    gFailure = std::move(failure);
    gHappened = false;
    gLeft = n;
}

FailingNew::~FailingNew() {
    gLeft = 0;
}

bool FailingNew::happened() {
    return gHappened;
}

} // namespace orvela
