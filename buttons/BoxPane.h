// A rectangle that draws nothing: room that is kept for something.
//
// It takes neither the mouse nor the keyboard.
#pragma once
#include "host/GlogPane.h"

class GlogStyleSheet;

class BoxPane : public GlogPane {
public:
    // Attach the pane under the number 0, to the glog that owns it from then on; with a null glog it stays
    // unattached and without box. The rectangle of a sheet is its "BoundsRect", zero when absent; a sheet
    // without an item fails the assertion of its pointer.
    BoxPane(glogRec *, Rect &);
    BoxPane(glogRec *, GlogStyleSheet *);

protected:
    void DrawGuts(OSRgn *updateRegion) override;
};
