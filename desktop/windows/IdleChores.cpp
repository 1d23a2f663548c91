#include "desktop/windows/IdleChores.h"
#include <algorithm>
#include "desktop/windows/EventLoop.h"
#include "host/CIdleChore.h"

namespace {
double const kSecondsPerTick = 1.0 / 60.0; // an interval counts ticks
}

void IdleChores::Assign(CIdleChore *chore, double now) {
    Cancel(chore);
    double const interval = chore->interval > 0 ? static_cast<double>(chore->interval) * kSecondsPerTick : 0;
    bool const waits = chore->useInitialDelay == CIdleChore::kInitialDelay;
    entries.push_back({chore, interval, waits ? now + interval : now});
}

void IdleChores::Cancel(CIdleChore *chore) {
    entries.erase(std::remove_if(entries.begin(), entries.end(), [=](Entry const &e) { return e.chore == chore; }),
                  entries.end());
}

void IdleChores::Run(double now) {
    std::vector<CIdleChore *> due;
    for (Entry &entry : entries) {
        if (entry.due > now)
            continue;
        due.push_back(entry.chore);
        entry.due = now + entry.interval;
    }
    for (CIdleChore *chore : due)
        if (std::any_of(entries.begin(), entries.end(), [=](Entry const &e) { return e.chore == chore; }))
            chore->DoIdle();
}

double IdleChores::UntilNext(double now) const {
    double next = -1;
    for (Entry const &entry : entries) {
        if (entry.interval <= 0)
            continue;
        double const wait = std::max(0.0, entry.due - now);
        next = next < 0 ? wait : std::min(next, wait);
    }
    return next;
}

CIdleChore::CIdleChore(long long interval_, UseInitialDelay useInitialDelay_)
    : interval(interval_), useInitialDelay(useInitialDelay_) {}

CIdleChore::~CIdleChore() { Cancel(); }

void CIdleChore::Assign() {
    if (EventLoop *loop = EventLoop::Open())
        loop->Chores().Assign(this, loop->Windows().Now());
}

void CIdleChore::Cancel() {
    if (EventLoop *loop = EventLoop::Open())
        loop->Chores().Cancel(this);
}
