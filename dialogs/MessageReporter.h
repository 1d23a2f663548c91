// Reports what a pane tells its listeners to those who watch the desktop's messages.
#pragma once
#include "frame/Provider.h"

// A listener that hangs on one pane for as long as the pane lives, and goes with it. Made with new and then
// left to itself; the derived class writes a line for each message while MessageTrace is on.
template <class Listener> class MessageReporter : public Listener {
public:
    explicit MessageReporter(Provider<Listener> *provider) { Dependent<Listener>::DependUpon(provider); }

protected:
    ~MessageReporter() {}

private:
    void ProviderDying(Provider<Listener> *) override { delete this; }
};
