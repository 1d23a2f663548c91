// A push button with rounded ends, 19 pixels high and of any width.
//
// Pressing it works as with any push button, and a click gives 1. Its label comes from the string list 4323.
// A pressed button shows the label one pixel lower.
#pragma once
#include "buttons/GlogButtonPane.h"
#include "buttons/gobResRec.h"
#include "host/TextLayout.h"

class GlogStyleSheet;

class OvalButtonPane : public GlogButtonPane {
public:
    // Make a button and attach it to the glog, which owns it from then on; null when memory or glog is
    // wanting. The record and the sheet are only read. Of the sheet's "BoundsRect" (zero when absent) top,
    // left and width count; label and mode are "TextNum" and "Mode". A sheet without an item fails the
    // assertion of its pointer.
    static OvalButtonPane *NewOvalButtonPane(glogRec *, gobResRec *);
    static OvalButtonPane *NewOvalButtonPane(glogRec *, GlogStyleSheet *);

    // The label.
    void GetButtonText(UString &) const override;
    // Stores the label and no more: it shows when the caller has the pane repainted.
    void SetButtonText(UString);

protected:
    OvalButtonPane();
    // Attach the pane in the mode given and set its box and label, the latter by its number in the string
    // list. The pane's layout item takes the layout properties of oval buttons from the glog's style sheet.
    OvalButtonPane *InitOvalButtonPane(glogRec *, gobResRec *);
    OvalButtonPane *InitOvalButtonPane(glogRec *, Point topLeft, short width, short textNum, short mode);

    void DrawGuts(OSRgn *updateRegion) override;

private:
    void DrawFace(Rect const &) const;
    void DrawMiddle(Rect const &, short icon) const;

    UString label;
    OS::TextLayout layout; // of the label, as it was last drawn
};
