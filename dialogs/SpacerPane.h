// Takes up room in a group and draws nothing.
#pragma once
#include "host/GlogPane.h"

class SpacerPane : public GlogPane {
public:
    // Makes a spacer and attaches it to the glog, which owns it from then on; null when memory or glog is
    // wanting. Its size is what its layout item is told.
    static SpacerPane *NewSpacerPane(glogRec *);

protected:
    SpacerPane() {}
    void DrawGuts(OSRgn *) override {}
};
