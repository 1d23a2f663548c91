// What a layout item knows.
#pragma once
#include "host/GlogLayout.h"
#include <memory>
#include <string>
#include <vector>

class CompoundPane;
class GlogPane;

// Lengths are pixels. An item is the rectangle of a pane, a part of a pane (a sub-item), or a group of items;
// which of them the pointers tell.
struct GlogLayoutItem::Rep {
    // What only groups have, and items that are in one or were told more than most. The parts of panes, of
    // which there are two to every check box, do without.
    struct Further {
        int id = -1; // a pane number
        std::string name;
        Rect place{0, 0, 0, 0};
        short minWidth = 0, minHeight = 0;
        short growWidth = 0, growHeight = 0;  // shares of the room that is left over
        short alignment = 0;                  // across the group: 0 start, 1 centre, 2 end, 3 fill
        short spacing = 0;                    // between a group's items
        CompoundPane *owner = nullptr;        // of the outermost group of a pane
        GlogStyleSheet *styleSheet = nullptr; // a group's; not owned
        std::vector<RCPtr<GlogLayoutItem>> children;
        GlogLayoutItem *parent = nullptr; // of an item with an inner rectangle
    };

    // Panes with thousands of parts ask all of them where they lie, so that all this fits into one line of
    // the processor's cache.
    GlogPane *pane = nullptr;    // whose rectangle or part this is; null once the pane is gone
    Rect made{0, 0, 0, 0};       // where the item stood when it was made
    short width = 0, height = 0; // natural size; 0 or less: not told, the made rectangle counts
    short insetTop = 0, insetLeft = 0, insetBottom = 0, insetRight = 0;
    bool isPart : 1;   // a sub-item of `pane`
    bool hasInner : 1; // see Inner
    bool hasPlace : 1; // the further place counts
    bool isGroup : 1;
    bool vertical : 1; // a group's direction
    int index : 27;    // among the parts of a pane

    Rep()
        : isPart(false)
        , hasInner(false)
        , hasPlace(false)
        , isGroup(false)
        , vertical(true)
        , index(0)
        , parent(nullptr) {}
    // The group that holds the item.
    GlogLayoutItem *Parent() const { return hasInner ? Rest().parent : parent; }
    void SetParent(GlogLayoutItem *group) { (hasInner ? OwnRest().parent : parent) = group; }
    // Of two nested rectangles, the inner one, from the top left of the outer. It is set before the item has
    // a parent.
    Rect Inner() const { return hasInner ? inner : Rect{0, 0, 0, 0}; }
    void SetInner(Rect const &r) {
        hasInner = true;
        inner = r;
    }
    // As they are, or what they are when nothing was said.
    Further const &Rest() const { return further ? *further : Unsaid(); }
    // To be changed.
    Further &OwnRest() {
        if (!further)
            further = std::make_unique<Further>();
        return *further;
    }

private:
    static Further const &Unsaid();

    union {
        Rect inner;             // when there is one: a part of a pane, and in no group as a rule
        GlogLayoutItem *parent; // otherwise
    };
    std::unique_ptr<Further> further;
};
