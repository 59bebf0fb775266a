#include "faults/FailingAllocations.h"

#include <cstdlib>
#include <new>

namespace {

// Not positive: no call fails.
thread_local long long callsLeft = 0;
thread_local bool happened = false;

} // namespace

FailingAllocation::FailingAllocation(long long n) {
    happened = false;
    callsLeft = n;
}

FailingAllocation::~FailingAllocation() {
    callsLeft = 0;
}

bool FailingAllocation::Happened() const {
    return happened;
}

void* operator new(std::size_t bytes) {
    if (callsLeft > 0 && --callsLeft == 0) {
        happened = true;
        throw std::bad_alloc();
    }
    if (void* memory = std::malloc(bytes == 0 ? 1 : bytes)) return memory;
    throw std::bad_alloc();
}

void operator delete(void* memory) noexcept {
    std::free(memory);
}

void operator delete(void* memory, std::size_t) noexcept {
    std::free(memory);
}
