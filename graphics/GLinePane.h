// A thin line that divides one part of a window from another.
//
// It takes neither the mouse nor the keyboard.
#pragma once
#include "graphics/GLineResRec.h"
#include "host/GlogPane.h"

class GlogStyleSheet;

class GLinePane : public GlogPane {
public:
    // Make a line and attach it to the glog under the number 0, which owns it; null when memory or glog is
    // wanting. The record's ends are taken as they are; the sheet's "BoundsRect" (all zero when absent) may
    // have them in any order. The box, set by SetBox, has room for the line: a pixel more along it, three
    // across.
    static GLinePane *NewGLinePane(glogRec *, GLineResRec *);
    static GLinePane *NewGLinePane(glogRec *, GlogStyleSheet *);
    ~GLinePane() override;

protected:
    // In a layout the line runs along the longer side of its place, through the middle; a square has an
    // upright one.
    void DrawGuts(OSRgn *updateRegion) override;

private:
    GLinePane();
    bool Init(glogRec *, GLineResRec const &);

    bool vertical; // how it was made; a layout decides by its place
};
