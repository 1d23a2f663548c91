// The binary record of an oval button.
#pragma once
#include <cstddef>

// The comments name the XML keys that hold the same values.
struct gobResRec {
    enum { kKind = 18 };

    short kind;  // its low byte is kKind; the reader does not look at it
    short top;   // "BoundsRect"
    short left;  // "BoundsRect"
    short width; // "BoundsRect": right less left
    short text;  // "TextNum": index in the string list of oval button labels
    short mode;  // "Mode": as GlogButtonPane::SetMode, the low byte
};

static_assert(sizeof(gobResRec) == 12, "gobResRec has the layout of its resource");
static_assert(offsetof(gobResRec, top) == 2 && offsetof(gobResRec, left) == 4 &&
                  offsetof(gobResRec, width) == 6 && offsetof(gobResRec, text) == 8 &&
                  offsetof(gobResRec, mode) == 10,
              "gobResRec has the layout of its resource");
