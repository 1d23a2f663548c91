// One string out of several, chosen by its index: a word that follows a state.
//
// The pane takes neither the mouse nor the keyboard, and sends no messages.
#pragma once
#include "host/GlogPane.h"
#include "host/UString.h"
#include <vector>

class GlogStyleSheet;
struct glogRec;

// No string is chosen at first, and none must be drawn or asked for before one is: see SelectString. An index
// that the list does not have must not be chosen.
class MultiStringPane : public GlogPane {
public:
    // Makes a pane, attaches it to the glog, which owns it from then on, and reads the sheet. The glog must
    // not be null.
    static MultiStringPane *NewMultiStringPane(glogRec *, int id, GlogStyleSheet *);
    ~MultiStringPane() override;

    // Appends the strings of the sheet, from the keys "Origin" (where the baseline starts outside a layout),
    // "FSRID", "Align" (stored only), "TextList" with a string for each, and "LineSpacing", which becomes the
    // height attribute of the layout item. A sheet without "TextList", or with something else in it, fails
    // the assertion of its pointer.
    void GetFromXML(GlogStyleSheet *);

    // Shows the string at the index, from 0, and makes its width the width attribute of the layout item; the
    // box stays. Invalidates the pane before and after. Without effect for the string that is shown.
    void SelectString(int index);
    // Assigns the string that is shown.
    void GetCurrentString(UString &) const;

    // For tools that show what a dialog holds; the index is -1 while none is chosen.
    int CurrentIndex() const { return current; }
    std::size_t CountStrings() const { return strings.size(); }

protected:
    void DrawGuts(OSRgn *) override;

private:
    MultiStringPane();
    UString const &Current() const { return strings[static_cast<std::size_t>(current)]; }

    int lineSpacing; // pixels
    Point origin;
    int current;
    std::vector<UString> strings;
    int font; // index in the application's font table
    int alignment;
};

// What other programs reach the pane by.
extern void (*gstrSetIndStr)(MultiStringPane *, int); // SelectString
