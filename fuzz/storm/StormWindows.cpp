#include "fuzz/storm/StormWindows.h"

bool StormWindows::AtEnd() const { return !HasMore() && SimulatedWindowSystem::AtEnd(); }

// True for an event that is handed out at once.
bool StormWindows::Take(StormEvent const &next, InputEvent &event) {
    Append(next.steps);
    // Steps like pauses lead to no event, and whoever waits for one would find the script at its end.
    if (!next.steps.empty()) {
        ScriptStep nothing;
        nothing.kind = ScriptStep::kMenu;
        Append({nothing});
    }
    if (!next.isOther)
        return false;
    event = next.other;
    event.time = Now();
    return true;
}

bool StormWindows::WaitEvent(InputEvent &event, double timeout, Waiter waiter, char const *what) {
    while (SimulatedWindowSystem::AtEnd() && HasMore()) {
        if (Take(source->Next(waiter), event))
            return true;
        // Who asks without waiting, or wants to rest, may be left alone.
        if (timeout >= 0 && waiter != Waiter::kMainLoop)
            break;
    }
    if (source && SimulatedWindowSystem::AtEnd() && waiter == Waiter::kModal && timeout < 0 &&
        Take(source->EndOfWait(), event))
        return true;
    return SimulatedWindowSystem::WaitEvent(event, timeout, waiter, what);
}
