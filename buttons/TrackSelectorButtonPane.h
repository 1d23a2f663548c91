// The small button, with two states, by which tracks are chosen.
//
// A completed click flips its state and then tells the listeners; it reports nothing to the window.
#pragma once
#include "buttons/GIconButtonPane.h"
#include "frame/Provider.h"
#include "frame/TrackSelectorButtonPane_Listener.h"

class TrackSelectorButtonPane : public Provider<TrackSelectorButtonPane_Listener>, public GIconButtonPane {
public:
    // Attaches the button under the number 0, to the glog that owns it from then on; with a null glog it
    // stays unattached. It has a help tag and a natural size of 15 x 16 pixels.
    explicit TrackSelectorButtonPane(glogRec *);

    // Tells the listeners; -1.
    int ReleaseAction() override;
};
