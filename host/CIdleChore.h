// Something to be done when the application has nothing else to do.
#pragma once

class IdleChores;

// Calls DoIdle again and again while it is assigned. Belongs to whoever made it.
class CIdleChore {
public:
    // Whether the first call waits for the interval as well.
    enum UseInitialDelay { kNoInitialDelay = 0, kInitialDelay = 1 };

    // The interval between calls, in ticks of 1/60 second; 0 or less: at every idle time. A call that comes
    // late is not made up for. Not assigned yet.
    CIdleChore(long long interval, UseInitialDelay);
    virtual ~CIdleChore(); // cancels

    // Starts being called, by the desktop that is open, until it closes; without effect while it is called
    // already, and without a desktop.
    void Assign();
    // Stops being called. May be used from DoIdle.
    void Cancel();

protected:
    // The chore itself, to be done in little time. Called between events, in nested loops too; not while an
    // earlier call has not returned.
    virtual void DoIdle() = 0;

private:
    friend class IdleChores;
    CIdleChore(CIdleChore const &);
    CIdleChore &operator=(CIdleChore const &);

    long long interval;
    UseInitialDelay useInitialDelay;
};
