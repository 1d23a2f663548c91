#pragma once

class CIdleChore {
public:
    enum UseInitialDelay { kNoInitialDelay = 0, kInitialDelay = 1 };
    CIdleChore(long long interval, UseInitialDelay);
    virtual ~CIdleChore();
    void Assign();
    void Cancel();
protected:
    virtual void DoIdle() = 0;
private:
    CIdleChore(CIdleChore const &);
    CIdleChore &operator=(CIdleChore const &);
    long long interval;
    UseInitialDelay useInitialDelay;
};
