#include "desktop/windows/IdleChores.h"
#include "desktop/windows/EventLoop.h"
#include "host/CIdleChore.h"
#include <algorithm>

namespace {
double const kSecondsPerTick = 1.0 / 60.0; // an interval counts ticks
}

void IdleChores::Assign(CIdleChore *chore, double now) {
    if (Find(chore))
        return;
    double const interval = chore->interval > 0 ? static_cast<double>(chore->interval) * kSecondsPerTick : 0;
    bool const waits = chore->useInitialDelay == CIdleChore::kInitialDelay;
    entries.push_back({chore, interval, waits ? now + interval : now, round, false, false});
}

void IdleChores::Cancel(CIdleChore *chore) {
    entries.erase(
        std::remove_if(entries.begin(), entries.end(), [=](Entry const &e) { return e.chore == chore; }),
        entries.end());
}

void IdleChores::Run(double now) {
    // A chore may wait, and so have chores run meanwhile: those are not due any more.
    unsigned long const thisRound = ++round;
    while (Entry *const entry = NextDue(now, thisRound)) {
        entry->round = round;
        entry->due = now + entry->interval;
        entry->hasRun = true;
        // A chore that waits in its DoIdle is not run again meanwhile; it may also go, or be assigned anew.
        struct Running {
            Running(IdleChores &chores_, CIdleChore *chore_)
                : chores(chores_)
                , chore(chore_) {
                Set(true);
            }
            ~Running() { Set(false); }
            void Set(bool on) {
                if (Entry *running = chores.Find(chore))
                    running->running = on;
            }
            IdleChores &chores;
            CIdleChore *chore;
        } const running(*this, entry->chore);
        entry->chore->DoIdle();
    }
}

// Those that were assigned or have run since the round began have to wait for the next.
IdleChores::Entry *IdleChores::NextDue(double now, unsigned long thisRound) {
    for (Entry &entry : entries)
        if (!entry.running && entry.due <= now && entry.round < thisRound)
            return &entry;
    return nullptr;
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
        // What has no interval wakes nobody, but does not wait for its first turn either.
        if (entry.running || (entry.interval <= 0 && entry.hasRun))
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
