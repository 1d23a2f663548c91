// Hears that a pane is being used, so that using it can turn on the button that stands for it: typing into
// the field beside a check box, say, turns the check box on.
#pragma once
#include "frame/Provider.h"

class AutoSetActivityListener : public Dependent<AutoSetActivityListener> {
public:
    AutoSetActivityListener();
    virtual ~AutoSetActivityListener();

    // The pane behind the provider is about to be used: a text field before each key that changes its text,
    // before it takes a click and before text is pasted into it, a pop-up menu before it opens. The source is
    // the provider base of that pane, the same pointer that was subscribed to.
    virtual void ListenToActivity(Provider<AutoSetActivityListener> *source) = 0;
};

// Tells the listeners that the sender is about to be used.
class AutoSetActivityMsg : public DependentCastMessenger<AutoSetActivityListener> {
public:
    explicit AutoSetActivityMsg(Provider<AutoSetActivityListener> *sender)
        : source(sender) {}
    void BroadcastChange(AutoSetActivityListener *listener) override;

private:
    Provider<AutoSetActivityListener> *source;
};

extern template class Provider<AutoSetActivityListener>;
extern template class Dependent<AutoSetActivityListener>;
extern template class DependentCastMessenger<AutoSetActivityListener>;
