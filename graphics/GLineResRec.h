// The record of a dividing line.
#pragma once
#include "host/Geometry.h"
#include <cstddef>

// Field after field. Left and right alike make an upright line.
struct GLineResRec {
    enum { kKind = 11 };

    short kind;                     // kKind; the pane does not look at it
    short top, left, bottom, right; // "BoundsRect", which may name its corners in any order
};

static_assert(sizeof(GLineResRec) == 10 && offsetof(GLineResRec, top) == 2 &&
                  offsetof(GLineResRec, right) == 8,
              "GLineResRec has the layout of its resource");
