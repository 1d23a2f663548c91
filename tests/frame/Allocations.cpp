#include "tests/frame/Allocations.h"
#include <cstdlib>
#include <new>

namespace {

long const kNever = -1;

long calls = 0;
long long bytes = 0;
long successesLeft = kNever;
bool failed = false;

void *Allocate(std::size_t size) {
    ++calls;
    bytes += static_cast<long long>(size);
    if (successesLeft == 0) {
        successesLeft = kNever;
        failed = true;
        throw std::bad_alloc();
    }
    if (successesLeft > 0)
        --successesLeft;
    void *const memory = std::malloc(size ? size : 1);
    if (!memory)
        throw std::bad_alloc();
    return memory;
}

} // namespace

Allocations::Counter::Counter()
    : start(calls)
    , startBytes(bytes) {}

long Allocations::Counter::Count() const { return calls - start; }

long long Allocations::Counter::Bytes() const { return bytes - startBytes; }

Allocations::FailAfter::FailAfter(long successes) {
    failed = false;
    successesLeft = successes;
}

Allocations::FailAfter::~FailAfter() { successesLeft = kNever; }

bool Allocations::FailAfter::HasFailed() const { return failed; }

void *operator new(std::size_t size) { return Allocate(size); }
void *operator new[](std::size_t size) { return Allocate(size); }
void operator delete(void *memory) noexcept { std::free(memory); }
void operator delete[](void *memory) noexcept { std::free(memory); }
void operator delete(void *memory, std::size_t) noexcept { std::free(memory); }
void operator delete[](void *memory, std::size_t) noexcept { std::free(memory); }
