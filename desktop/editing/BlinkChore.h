// What makes an insertion point blink.
#pragma once
#include "host/CIdleChore.h"
#include <functional>

// Calls its function every half second while it runs.
class BlinkChore : public CIdleChore {
public:
    explicit BlinkChore(std::function<void()> blink_)
        : CIdleChore(kTicks, kInitialDelay)
        , blink(std::move(blink_)) {}
    // The first call comes after the whole time, also when it ran already.
    void Restart() {
        Cancel();
        Assign();
    }

private:
    static constexpr long long kTicks = 30; // of 1/60 second
    void DoIdle() override { blink(); }

    std::function<void()> blink;
};
