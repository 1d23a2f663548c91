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
    // of parts ask all of them. All of it is packed: there are three items to every check box.
    GlogPane *pane = nullptr; // whose rectangle or part this is; null once the pane is gone
    Rect made{0, 0, 0, 0};    // where the item stood when it was made
    Rect place{0, 0, 0, 0};
    short width = 0, height = 0; // natural size; 0 or less: not told, the made rectangle counts
    short insetTop = 0, insetLeft = 0, insetBottom = 0, insetRight = 0;
    bool isPart = false; // a sub-item of `pane`
    bool hasPlace = false;

    bool isGroup = false;
    bool vertical = true; // a group's direction
    bool hasInner = false;
    Rect inner{0, 0, 0, 0}; // of two nested rectangles, the inner one, from the top left of the outer
    short minWidth = 0, minHeight = 0;
    short growWidth = 0, growHeight = 0; // shares of the room that is left over
    short alignment = 0;                 // across the group: 0 start, 1 centre, 2 end, 3 fill
    short spacing = 0;                   // between a group's items

    int id = -1;
    int index = 0;
    std::string name;
    CompoundPane *owner = nullptr;        // of the outermost group of a pane
    GlogLayoutItem *parent = nullptr;     // the group that holds the item
    GlogStyleSheet *styleSheet = nullptr; // a group's; not owned
    std::vector<RCPtr<GlogLayoutItem>> children;
};
