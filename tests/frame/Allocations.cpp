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

void *AllocateOrNull(std::size_t size) {
    try {
        return Allocate(size);
    } catch (std::bad_alloc const &) {
        return nullptr;
    }
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
// Those without exceptions would come to these by themselves, but not under the address sanitizer.
void *operator new(std::size_t size, std::nothrow_t const &) noexcept { return AllocateOrNull(size); }
void *operator new[](std::size_t size, std::nothrow_t const &) noexcept { return AllocateOrNull(size); }
void operator delete(void *memory, std::nothrow_t const &) noexcept { std::free(memory); }
void operator delete[](void *memory, std::nothrow_t const &) noexcept { std::free(memory); }
void operator delete(void *memory) noexcept { std::free(memory); }
void operator delete[](void *memory) noexcept { std::free(memory); }
void operator delete(void *memory, std::size_t) noexcept { std::free(memory); }
void operator delete[](void *memory, std::size_t) noexcept { std::free(memory); }
