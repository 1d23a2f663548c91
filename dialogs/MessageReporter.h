// Reports what a pane tells its listeners to those who watch the desktop's messages.
#pragma once
#include "frame/Provider.h"
#include <new>

// A listener that hangs on one pane for as long as the pane lives, and goes with it. Made with new and then
// left to itself; the derived class writes a line for each message while MessageTrace is on.
template <class Listener> class MessageReporter : public Listener {
public:
    // Throws std::bad_alloc when it cannot be made to hang on the pane, which tells nobody about it.
    explicit MessageReporter(Provider<Listener> *provider) {
        Dependent<Listener>::DependUpon(provider);
        Search search(this);
        provider->Provider<Listener>::BroadcastChange(search, nullptr);
        if (!search.found)
            throw std::bad_alloc();
    }

protected:
    ~MessageReporter() {}

private:
    // Goes to all listeners, and tells none of them anything.
    struct Search : DependentCastMessenger<Listener> {
        explicit Search(Listener *wanted_)
            : wanted(wanted_) {}
        void BroadcastChange(Listener *listener) override { found = found || listener == wanted; }
        Listener *wanted;
        bool found = false;
    };

    void ProviderDying(Provider<Listener> *) override { delete this; }
};
