// The ground and the frame of what scrolls. It takes no clicks.
#pragma once
#include "host/GlogPane.h"

class GlogStyleSheet;

class WellPane : public GlogPane {
public:
    // Makes a pane and attaches it to the glog, which owns it from then on; null when memory or glog is
    // wanting. From "BoundsRect".
    static WellPane *NewWellPane(glogRec *, GlogStyleSheet *);

    // For panes that are a well themselves. Changes the port's colours.
    static void DrawWell(Rect const &);

protected:
    void DrawGuts(OSRgn *updateRegion) override;
    int HandleClick(EventRecordAdapter *) override { return 0; }

private:
    WellPane() {}
};
