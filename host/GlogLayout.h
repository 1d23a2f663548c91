// Layout: boxes of items that share out the room of a pane.
//
// Every attached pane has a rectangle item, and every container a group, whether or not it is laid out. An
// item that was not laid out answers the rectangle that it was made with. Layout is settled when a place is
// asked for or drawn, not when something changes.
#pragma once
#include "host/Geometry.h"
#include "host/RCPtr.h"
#include "host/UString.h"
class GlogPane;
class GlogStyleSheet;
class LayoutEngine;

// An item of a layout: the rectangle of a pane, a part of a pane, or a group of items. Held by RCPtr.
class GlogLayoutItem : public RCObject {
public:
    struct Rep;

    // What can be said about an item. Lengths are pixels, from -32768 to 32767; values beyond are cut.
    enum Attribute {
        kInsetTop = 1, // room to keep free inside the edge
        kInsetLeft = 2,
        kWidth = 3, // natural size
        kHeight = 4,
        kInsetBottom = 5,
        kInsetRight = 6,
        kGrowWidth = 7, // shares of what room is left over, 0 (default): none
        kGrowHeight = 8,
        kAlignment = 9, // across the group: 0 start, 1 centre, 2 end, 3 fill
        kMinWidth = 10, // least size
        kMinHeight = 11,
        kSpacing = 12,  // of a group: room between its items
        kDirection = 13 // of a group, as a word
    };

    // Unit of a value. Only pixels are in use.
    enum CoordinateType { kPixels = 1 };

    // Sets an attribute; the string is empty. A value that differs makes the layout invalid.
    virtual void SetAttribute(Attribute, int value, CoordinateType, UString const &);

    // Sets an attribute that is given by a word: kDirection is "horiz", or else
    // downward. Without effect for other attributes.
    virtual void SetAttributeFromString(Attribute, UString const &);
    // The item's rectangle as laid out, insets included, in the coordinates of the pane that it belongs to.
    Rect GetBorderRect();
    // The name, by default empty; parts are named after their pane. Stays the item's.
    char const *GetName() const;

protected:
    GlogLayoutItem();
    virtual ~GlogLayoutItem();

private:
    friend class LayoutEngine;
    // A Rep, whose fields are the desktop's. Within the item, since a pane may have thousands of parts.
    alignas(void *) unsigned char rep[48];
};

// The rectangle of a pane or of a part of one.
class GlogLayoutRectItem : public GlogLayoutItem {
public:
    // The inner rectangle of an item that was made of two, else the same as GetBorderRect.
    Rect GetItemRect();

    // Reads attributes from the container "Layout" of the sheet, under the keys "InsetTop", "InsetLeft",
    // "InsetBottom", "InsetRight", "Width", "Height", "GrowWidth", "GrowHeight", "Alignment", "MinWidth" and
    // "MinHeight". The pane type is 8 for an editable text, 18 an oval button, 43 a pop-up menu, 53 radio
    // buttons, 54 check boxes. A null sheet reads nothing.
    void ReadLayoutProperties(int paneType, GlogStyleSheet *);
};

// A box of items, one below the other or side by side.
class GlogLayoutGroup : public GlogLayoutItem {
public:
    // An empty group; true stacks downward.
    explicit GlogLayoutGroup(bool vertical);

    // Takes the item out of the group that holds it and puts it into this one at the index, from 0; -1: at
    // the end. Null and the group itself have no effect.
    void MoveItem(RCPtr<GlogLayoutItem> const &, int index);

    // Puts the second item in the place of the first, which leaves the group; a null second only takes the
    // first out. Without effect when the first is not in this group.
    void ReplaceItem(RCPtr<GlogLayoutItem> const &, RCPtr<GlogLayoutItem> const &);
    // Looks through the group and the groups in it for the item of a pane number or of a name; null when
    // there is none.
    RCPtr<GlogLayoutItem> FindItemByID(int id);
    RCPtr<GlogLayoutItem> FindItemByName(char const *name);
    // The sheet that describes the group; may be null, and is not the group's.
    GlogStyleSheet *GetStyleSheet() const;
    void SetStyleSheet(GlogStyleSheet *);
};

namespace GlogLayout {

// An item for a part of a pane. The id is a pane number, -1 for none; the index is the part's place among its
// pane's parts; the name may be null.
RCPtr<GlogLayoutRectItem> MakeRectItem(Rect, int id, int index, char const *name);

// The same with a rectangle inside the part's, counted from the top left of the outer one, which moves along
// with it.
RCPtr<GlogLayoutRectItem> MakeRectItem(Rect inner, Rect outer, int id, int index, char const *name);
} // namespace GlogLayout

// Brackets a drawing or change during which the rectangles of the layout have to be up to date: settles the
// layout at both ends. The pane must outlive it.
class WithPerformLayoutRectUpdate {
public:
    explicit WithPerformLayoutRectUpdate(GlogPane *);
    ~WithPerformLayoutRectUpdate();

private:
    WithPerformLayoutRectUpdate(WithPerformLayoutRectUpdate const &);
    WithPerformLayoutRectUpdate &operator=(WithPerformLayoutRectUpdate const &);
    GlogPane *pane;
};
