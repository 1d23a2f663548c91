// The record of a graph.
#pragma once
#include "host/Geometry.h"
#include <cstddef>

struct GraphPaneResRec {
    enum { kKind = 12 };

    short kind;  // kKind; the pane does not look at it
    Rect bounds; // "BoundsRect"
};

static_assert(sizeof(GraphPaneResRec) == 10 && offsetof(GraphPaneResRec, bounds) == 2,
              "GraphPaneResRec has the layout of its resource");
