// Printing: the paper, and what a pane is asked to print.
#pragma once
#include "host/Geometry.h"
#include "host/UString.h"

// What a page is like.
class PageFormat {
public:
    explicit PageFormat(Rect const &page_)
        : page(page_) {}
    // The format of the print job or, without one, that of the next; the flag makes no difference. Stays the
    // host's; null while no desktop is open.
    static PageFormat *GetCurrentFormat(bool);
    // What can be printed on, in logical pixels, of which an inch has 72, from (0, 0).
    Rect GetPageRect() const { return page; }

private:
    Rect page;
};

// One step of printing a pane, handed to GlogPane::Print. A pane that prints answers to the start whether it
// has anything to print, and to each page whether there is another. Every start is followed by an end.
// Whatever the pane prepares while it prints is the page, with the coordinates of GetPageRect.
struct PrintMessageRec {
    int kind;          // 2 start at the page, 3 print one page, 4 end
    int page;          // from 1; while pages are printed, the number of the page in the whole job
    UString header[3]; // for the top of the page: the first line, what stands right of it, the second line
};
