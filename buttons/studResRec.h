// The binary record of a stud button.
#pragma once
#include <cstddef>

// The comments name the XML keys that hold the same values.
struct studResRec {
    enum { kKind = 5 };

    short kind;  // kKind; the reader does not look at it
    short top;   // "BoundsRect"; below 0: counted from the bottom of the window
    short left;  // "BoundsRect"; below 0: counted from the right edge of the window
    short text;  // "TextID": index in the string list of stud labels
    short width; // "BoundsRect": right less left
};

static_assert(sizeof(studResRec) == 10, "studResRec has the layout of its resource");
static_assert(offsetof(studResRec, top) == 2 && offsetof(studResRec, left) == 4 &&
                  offsetof(studResRec, text) == 6 && offsetof(studResRec, width) == 8,
              "studResRec has the layout of its resource");
