// The ground and the frame of what scrolls, and a view with its two bars in it.
//
// The items in it are the view, the bar below it and the bar beside it, in this order; they follow the well's
// size.
#pragma once
#include "host/CompoundPane.h"

class GlogStyleSheet;

class WellPane : public CompoundPane {
public:
    // Makes an empty well and attaches it to the glog, which owns it from then on; null when memory or glog
    // is wanting. From "BoundsRect".
    static WellPane *NewWellPane(glogRec *, GlogStyleSheet *);

    // For panes that are a well themselves. Changes the port's colours.
    static void DrawWell(Rect const &);

    // Overridden operations of panes.
    void GlogItemInit() override;
    void SetBox(Rect *) override;

protected:
    void DrawBackgroundGuts(OSRgn *updateRegion) override;

private:
    WellPane();
    void ArrangeItems();
};
