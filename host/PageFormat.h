// Printing: the paper, and what a pane is asked to print.
#pragma once
#include "host/Geometry.h"
#include "host/UString.h"

class PageFormat {
public:
    // The format of the print job or the one that the next job would have. Stays the host's; null when there
    // is none.
    static PageFormat *GetCurrentFormat(bool);
    // What can be printed on, in logical pixels from (0, 0).
    Rect GetPageRect() const;
};

// One step of printing a pane, handed to GlogPane::Print.
struct PrintMessageRec {
    int kind;          // 2 start at the page, 3 print one page, 4 end
    int page;          // from 1
    UString header[3]; // texts for the top of the page: left, middle, right
};
