// The binary record of an icon pane.
#pragma once
#include <cstddef>

// The comments name the XML keys that hold the same values.
struct GIconResRec {
    enum { kKind = 47 };

    short kind;       // kKind; the reader does not look at it
    short top;        // "BoundsRect"
    short left;       // "BoundsRect"
    short width;      // "BoundsRect": right less left
    short height;     // "BoundsRect": bottom less top
    short family;     // "FamilyID": icon family, by name in XML
    short icon;       // "Num": icon of state 0
    short numStates;  // "NumStates"
    short canDisable; // "CanDisable": 1 when the family has an icon for the disabled look
};

static_assert(sizeof(GIconResRec) == 18, "GIconResRec has the layout of its resource");
static_assert(offsetof(GIconResRec, family) == 10 && offsetof(GIconResRec, canDisable) == 16,
              "GIconResRec has the layout of its resource");
