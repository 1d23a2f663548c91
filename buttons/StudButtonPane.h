// A text button on a face of any width, as it stands in a row along the edge of a window.
//
// Pressing it works as with any push button, and a click gives 1. Its label comes from the string list 4333.
#pragma once
#include "buttons/GlogButtonPane.h"
#include "buttons/studResRec.h"
#include "host/TextLayout.h"

class GlogStyleSheet;

class StudButtonPane : public GlogButtonPane {
public:
    // Left edges of buttons that stand in a row at the right of a window, the rightmost first; for
    // studResRec::left.
    static const short kGStud_Left = -80;
    static const short kGStud_Left2 = -160;
    static const short kGStud_Left3 = -240;
    static const short kGStud_Left4 = -320;
    static const short kGStud_Left5 = -400;

    // The mode in which nothing is drawn; clicks are refused.
    enum { kInvisible = 2 };

    // Make a button and attach it to the glog, which owns it from then on; null when memory or glog is
    // wanting. The record and the sheet are only read. Of the sheet's "BoundsRect" (zero when absent) top,
    // left and width count, the height is that of the face. A "TextID" of 1 or more may be a number of the
    // former string list and is then turned into the present one. A sheet without an item fails the assertion
    // of its pointer.
    static StudButtonPane *NewStudButtonPane(glogRec *, studResRec *);
    static StudButtonPane *NewStudButtonPane(glogRec *, GlogStyleSheet *);

    // Sets the label and invalidates the pane; without effect for the label that it has.
    void SetLabel(const UString &);
    // The same with a string of the list, by its present number. An unknown one is an empty label.
    void SetLabel(short id);
    // The label.
    void GetButtonText(UString &) const override;

protected:
    StudButtonPane();
    // Attaches the pane, enabled, and takes box and label from the record. Places counted from the far edges
    // are settled here, once: the button does not follow when the window is resized later.
    StudButtonPane *InitStudButtonPane(glogRec *, studResRec *);

    void DrawGuts(OSRgn *updateRegion) override;

private:
    short FirstFaceIcon() const;

    UString label;
    OS::TextLayout layout; // of the label
};
