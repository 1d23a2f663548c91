// The binary record of a box selection.
#pragma once
#include <cstddef>

// The comments name the XML keys that hold the same values.
struct boxSelResRec {
    enum { kKind = 14 };

    short kind;          // kKind; the reader does not look at it
    short numBoxes;      // at least 1 where one box at a time is on; in XML the number of items in "RectList"
    unsigned char style; // "Style": how a box that is on is marked
    unsigned char multiple; // "Mode": 0 one box at a time is on, otherwise each on its own
};

static_assert(sizeof(boxSelResRec) == 6 && offsetof(boxSelResRec, style) == 4,
              "boxSelResRec has the layout of its resource");
