// Lines that are only read, with their scroll bars in strips at the right and below.
//
// The bars and the wheel scroll; the strips follow the box.
#pragma once
#include "host/CompoundPane.h"

class GlogStyleSheet;

class LinesPane : public CompoundPane {
public:
    // Makes a pane and attaches it to the glog, which owns it from then on; null when memory or glog is
    // wanting. From "BoundsRect" and "Num", how many lines there are. The bars have the item numbers 904, at
    // the right, and 905.
    static LinesPane *NewLinesPane(glogRec *, GlogStyleSheet *);

    // Overridden operations of panes. The lines fill what the strips leave.
    void SetBox(Rect *) override;

protected:
    void DrawBackgroundGuts(OSRgn *updateRegion) override;

private:
    class Lines;
    class Gutter;

    explicit LinesPane(int numLines);
    bool Init(glogRec *, Rect box);

    int const numLines;
    Lines *lines = nullptr; // a subpane, from Init on
};
