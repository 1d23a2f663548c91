// A line of text in which each part has a look of its own.
//
// The pane takes neither the mouse nor the keyboard, and sends no messages.
#pragma once
#include "host/AutoPtr.h"
#include "host/GlogPane.h"
#include "host/StyledString.h"

struct glogRec;

class StyledStringPane : public GlogPane {
public:
    // Where the text stands in the box. Any other value counts as kLeft.
    enum { kLeft = 0, kRight = 1, kCentre = 2 };

    // Attaches the pane to the glog under the number, without text. With `keepRightDistance` the box's right
    // edge follows that of the window. Takes the height of the line and the room above it, in pixels, from
    // the keys "GStyledString_LineSpacing" and "GStyledString_TopBorder" of the glog's style sheet (0 when
    // absent). Without a glog the pane is not attached.
    StyledStringPane(glogRec *, short id, bool keepRightDistance);
    ~StyledStringPane() override;

    // Takes the text over and deletes the former one; null shows nothing. Invalidates the pane and tells the
    // layout item width and height. The text that the pane has may be handed over once more.
    void AdoptStyledString(AutoPtr<StyledString>);
    // Takes the part over as the whole text.
    void AdoptStyledStringItem(AutoPtr<StyledStringItem>);
    // Both repaint nothing.
    void SetAlignment(int newAlignment) { alignment = newAlignment; }
    void SetEraseBackground(bool erases) { eraseBackground = erases; } // before the text is drawn

    // GlogPane. The second measures the right distance anew where it is kept; the first restores it, and
    // gives the layout item the width of the text and the height of the line.
    void CalcBox() override;
    void SetBox(Rect *) override;

protected:
    void DrawGuts(OSRgn *) override;

private:
    short DistanceOf(short right) const;
    short TextLeft(Rect const &box) const;

    StyledString *styledString; // the pane's; may be null
    int alignment;
    bool keepRightDistance;
    bool eraseBackground;
    short rightDistance; // pixels from the box to the window's right edge
    int lineSpacing;
    int topBorder;
};
