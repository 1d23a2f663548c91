// A plain list: lines of equal height in a scrolled area, without columns and selection.
//
// It scrolls by pixels; the wheel and its bars work as those of every ScrollPane. A derived class draws the
// lines.
#pragma once
#include "scrolling/ScrollPane.h"

class ListPane : public ScrollPane {
public:
    // An empty box without lines, under the number 0; the height is that of a line, in pixels. A null glog
    // leaves the pane unattached.
    ListPane(glogRec *, int lineHeight);

    // Draws one line, from 0, whose box is in the coordinates of the area. The clip is what is to be drawn of
    // it.
    virtual void DrawLine(int line, Rect rowBox) = 0;
    // Pixels that the lines need in width.
    virtual int GetListWidth() = 0;

    // Sets how many lines there are. Where that makes the area higher or lower the pane is invalidated, and
    // the middle of what is seen stays in the middle, a view at the very start or end there; otherwise call
    // Inval for lines that have come or gone. What lies below 32767 pixels cannot be reached: coordinates are
    // 16 bits wide.
    void SetNumLines(int);
    int GetNumLines() const { return numLines; }
    int GetLineHeight() const { return lineHeight; } // pixels

    // Overridden operations of scrolled panes and panes.
    int GetScrollDelta() const override; // a line
    void SetBox(Rect *) override;

protected:
    // Makes the area as large as the lines and the box need; to be called when GetListWidth has changed.
    void InvalListDimensions();

private:
    class HelperPane;

    HelperPane *helperPane; // a subpane that fills the area
    int lineHeight;
    int numLines;
};
