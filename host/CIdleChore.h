// Something to be done when the application has nothing else to do.
#pragma once

class IdleChores;

// Calls DoIdle again and again while it is assigned. Belongs to whoever made it.
class CIdleChore {
public:
    // Whether the first call waits for the interval as well.
    enum UseInitialDelay { kNoInitialDelay = 0, kInitialDelay = 1 };

    // The interval between calls, in ticks of 1/60 second; 0: at every idle time. Not assigned yet.
    CIdleChore(long long interval, UseInitialDelay);
    virtual ~CIdleChore(); // cancels

    // Starts being called; without effect when that has been done.
    void Assign();
    // Stops being called. May be used from DoIdle.
    void Cancel();

protected:
    virtual void DoIdle() = 0; // the chore itself, to be done in little time

private:
    friend class IdleChores;
    CIdleChore(CIdleChore const &);
    CIdleChore &operator=(CIdleChore const &);

    long long interval;
    UseInitialDelay useInitialDelay;
};
