// The binary record of a strip of icons.
#pragma once
#include "host/Geometry.h"
#include <cstddef>

// The comments name the XML keys that hold the same values.
struct SuccessiveIconsResRec {
    enum { kKind = 64 };

    short kind;   // kKind; the reader does not look at it
    Rect bounds;  // "BoundsRect"; two bytes that mean nothing follow
    int family;   // "FamilyID": icon family, by name in XML
    int baseIcon; // "BaseIcon": index of the leftmost icon
    int width;    // "Width": from one icon to the next, in pixels; at least 1
};

static_assert(sizeof(SuccessiveIconsResRec) == 24 && offsetof(SuccessiveIconsResRec, bounds) == 2 &&
                  offsetof(SuccessiveIconsResRec, family) == 12 &&
                  offsetof(SuccessiveIconsResRec, width) == 20,
              "SuccessiveIconsResRec has the layout of its resource");
