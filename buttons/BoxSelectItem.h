// One box of a box selection.
#pragma once
#include "host/Geometry.h"

struct BoxSelectItem {
    Rect bounds; // in the pane's coordinates; in a layout counted from the pane's top left corner
    bool value;  // on or off
};
