// What a layout item knows.
#pragma once
#include "host/GlogLayout.h"
#include <string>
#include <vector>

class CompoundPane;
class GlogPane;

// Lengths are pixels. An item is the rectangle of a pane, a part of a pane (a sub-item), or a group of items;
// which of them the pointers tell.
struct GlogLayoutItem::Rep {
    // What tells where a part lies stands first, in one line of the processor's cache: panes with thousands
    // of parts ask all of them.
    GlogPane *pane = nullptr; // whose rectangle or part this is; null once the pane is gone
    bool isPart = false;      // a sub-item of `pane`
    bool hasPlace = false;
    Rect made{0, 0, 0, 0}; // where the item stood when it was made
    Rect place{0, 0, 0, 0};
    int width = 0, height = 0; // natural size; 0 or less: not told, the made rectangle counts
    int insetTop = 0, insetLeft = 0, insetBottom = 0, insetRight = 0;

    Rect inner{0, 0, 0, 0}; // of two nested rectangles, the inner one, from the top left of the outer
    bool hasInner = false;
    CompoundPane *owner = nullptr;    // of the outermost group of a pane
    GlogLayoutItem *parent = nullptr; // the group that holds the item
    bool isGroup = false;

    int id = -1;
    int index = 0;
    std::string name;
    GlogStyleSheet *styleSheet = nullptr; // a group's; not owned

    int minWidth = 0, minHeight = 0;
    int growWidth = 0, growHeight = 0; // shares of the room that is left over
    int alignment = 0;                 // across the group: 0 start, 1 centre, 2 end, 3 fill

    bool vertical = true; // a group's direction
    int spacing = 0;      // between a group's items
    std::vector<RCPtr<GlogLayoutItem>> children;
};
