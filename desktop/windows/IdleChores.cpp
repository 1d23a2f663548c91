#include "desktop/windows/IdleChores.h"
#include "desktop/windows/EventLoop.h"
#include "host/CIdleChore.h"
#include <algorithm>

namespace {
double const kSecondsPerTick = 1.0 / 60.0; // an interval counts ticks
}

void IdleChores::Assign(CIdleChore *chore, double now) {
    Cancel(chore);
    double const interval = chore->interval > 0 ? static_cast<double>(chore->interval) * kSecondsPerTick : 0;
    bool const waits = chore->useInitialDelay == CIdleChore::kInitialDelay;
    entries.push_back({chore, interval, waits ? now + interval : now, false});
}

void IdleChores::Cancel(CIdleChore *chore) {
    entries.erase(
        std::remove_if(entries.begin(), entries.end(), [=](Entry const &e) { return e.chore == chore; }),
        entries.end());
}

void IdleChores::Run(double now) {
    std::vector<CIdleChore *> due;
    for (Entry &entry : entries) {
        if (entry.running || entry.due > now)
            continue;
        due.push_back(entry.chore);
        entry.due = now + entry.interval;
    }
    for (CIdleChore *chore : due) {
        if (!Find(chore))
            continue;
        // A chore that waits in its DoIdle is not run again meanwhile; it may also go, or be assigned anew.
        struct Running {
            Running(IdleChores &chores_, CIdleChore *chore_)
                : chores(chores_)
                , chore(chore_) {
                Set(true);
            }
            ~Running() { Set(false); }
            void Set(bool on) {
                if (Entry *entry = chores.Find(chore))
                    entry->running = on;
            }
            IdleChores &chores;
            CIdleChore *chore;
        } const running(*this, chore);
        chore->DoIdle();
    }
}

IdleChores::Entry *IdleChores::Find(CIdleChore *chore) {
    for (Entry &entry : entries)
        if (entry.chore == chore)
            return &entry;
    return nullptr;
}

double IdleChores::UntilNext(double now) const {
    double next = -1;
    for (Entry const &entry : entries) {
        if (entry.interval <= 0 || entry.running)
            continue;
        double const wait = std::max(0.0, entry.due - now);
        next = next < 0 ? wait : std::min(next, wait);
    }
    return next;
}

CIdleChore::CIdleChore(long long interval_, UseInitialDelay useInitialDelay_)
    : interval(interval_)
    , useInitialDelay(useInitialDelay_) {}

CIdleChore::~CIdleChore() { Cancel(); }

void CIdleChore::Assign() {
    if (EventLoop *loop = EventLoop::Open())
        loop->Chores().Assign(this, loop->Windows().Now());
}

void CIdleChore::Cancel() {
    if (EventLoop *loop = EventLoop::Open())
        loop->Chores().Cancel(this);
}
