// Hears that a scroll bar is going away.
#pragma once
#include "frame/Message.h"

class ScrollBarPane;

class ScrollBarPane_Listener : public Dependent<ScrollBarPane_Listener> {
public:
    ScrollBarPane_Listener();
    virtual ~ScrollBarPane_Listener();

private:
    friend class ScrollBarPane; // names ScrollBarPaneDying in its message

    // Nothing is left to do: ScrollBarPaneDying has been called before.
    void ProviderDying(Provider<ScrollBarPane_Listener> *) override {}
    // Sent from the bar's destructor, while the bar's fields and subpanes still stand.
    virtual void ScrollBarPaneDying() {}
};

extern template class Provider<ScrollBarPane_Listener>;
extern template class Dependent<ScrollBarPane_Listener>;
extern template class DependentCastMessenger<ScrollBarPane_Listener>;
extern template class Message0<ScrollBarPane_Listener>;
