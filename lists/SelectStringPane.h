// A line of text that can be selected.
//
// A click selects it; with the shift key, a click selects it or ends the selection. The box fits the text in
// the application's font 2, with a blank's width at either side.
#pragma once
#include "host/OSFont.h"
#include "host/UString.h"
#include "lists/SelectPane.h"

class SelectStringPane : public SelectPane {
public:
    // Attaches the pane to the glog under the number. The box is at the place that the glog knows for the
    // number, else at (0, 0). Without a glog the pane is not attached.
    SelectStringPane(glogRec *, short id, const UString &text);

    // Erases the pane at once, and repaints it in its new size.
    void SetText(const UString &);
    // What was set; the blanks around it are the pane's own.
    void GetText(UString &);

    // GlogPane. Takes the size from the text; the top left corner stays. In a layout the box stays, and the
    // size becomes the natural size of the layout item.
    void CalcBox() override;
    SelectStringPane *CastToSelectStringPane() override;
    // Both move the text along. Offset leaves the edit box where it was.
    void Offset(Point delta) override;
    void SetBox(Rect *) override;

    // SelectPane. Draws the text on a ground in the user's highlight colour, or in the window's.
    void _Draw_(OSRgn *region, char hilite) override; // NOLINT(bugprone-reserved-identifier)

protected:
    int HandleClick(EventRecordAdapter *) override; // -1

private:
    Point textOrigin; // of the baseline
    fontSaveRec font;
    UString text; // with its blanks
};
