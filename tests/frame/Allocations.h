// Counts uses of memory, and makes memory run out when a test wants it.
#pragma once

namespace Allocations {

// How often operator new was called since this was made, and for how much memory altogether.
class Counter {
public:
    Counter();
    long Count() const;
    long long Bytes() const;

private:
    long start;
    long long startBytes;
};

// From now on, so many calls of operator new succeed and the next one throws std::bad_alloc; after that one,
// and at the end of the scope, memory is there again.
class FailAfter {
public:
    explicit FailAfter(long successes);
    ~FailAfter();
    FailAfter(FailAfter const &) = delete;
    FailAfter &operator=(FailAfter const &) = delete;
    bool HasFailed() const;
};

} // namespace Allocations
