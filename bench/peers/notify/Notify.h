// What the comparison of notifications asks of a way to tell listeners.
#pragma once

// One sender, and listeners that count what they hear.
class Notify {
public:
    virtual ~Notify() {}

    // Adds listeners, each an object of its own, where the way has room for them; false elsewhere.
    virtual bool AddListeners(int count) = 0;
    // Sends one message to all of them.
    virtual void Send() = 0;
    // How often listeners have been called.
    virtual long long Heard() const = 0;
};

// Every program has its own.
Notify *NewNotify();
