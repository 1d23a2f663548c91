// The chores that run when nothing else does.
#pragma once
#include <vector>

class CIdleChore;

// All assigned chores and when they are due.
class IdleChores {
public:
    void Assign(CIdleChore *, double now);
    void Cancel(CIdleChore *);
    // Runs what is due: chores without interval at each call, the others when their time has come. A chore
    // may cancel itself or others.
    void Run(double now);
    // Seconds until the next chore that has an interval, or has not run yet; negative when there is none.
    double UntilNext(double now) const;
    bool Empty() const { return entries.empty(); }

private:
    struct Entry {
        CIdleChore *chore;
        double interval; // seconds
        double due;
        unsigned long round; // of Run, in which it was assigned or has run last
        bool running;        // waits in its own DoIdle
        bool hasRun;
    };
    Entry *Find(CIdleChore *); // null when it is not assigned
    Entry *NextDue(double now, unsigned long thisRound);
    std::vector<Entry> entries;
    unsigned long round = 0;
};
