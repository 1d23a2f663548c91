// Hears of completed clicks on a track selector button.
#pragma once
#include "frame/Message.h"

class TrackSelectorButtonPane_Listener : public Dependent<TrackSelectorButtonPane_Listener> {
public:
    TrackSelectorButtonPane_Listener();
    virtual ~TrackSelectorButtonPane_Listener();

    // The button was pressed and released inside.
    virtual void TrackSelectorButtonReleased() = 0;
};

extern template class Provider<TrackSelectorButtonPane_Listener>;
extern template class Dependent<TrackSelectorButtonPane_Listener>;
extern template class DependentCastMessenger<TrackSelectorButtonPane_Listener>;
extern template class Message0<TrackSelectorButtonPane_Listener>;
