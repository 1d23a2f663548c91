// Panes one after another, in a column or a row.
//
// The grid moves its members so that each begins where the one before ends, and leaves them their sizes. It
// takes no clicks of its own and no keys.
#pragma once
#include "host/CompoundPane.h"

class Grid : public CompoundPane {
public:
    // Not attached: GridInit comes next.
    Grid();
    // Attaches the grid under the number, as a column; null when it cannot be attached.
    Grid *GridInit(glogRec *, short id);

    // Adds the pane as CompoundPane does, and lays out everything from it on. The index, or a negative
    // number.
    short Add(GlogPane *, short position) override;
    // Deletes the member and lays out everything behind it. An index that does not exist has no effect.
    void Del(short index) override;

    // Moves a member to another index, and lays out what lies between them. A subclass sees the member go by
    // DelGuts, but not come by AddGuts: it is no addition. Without effect when there is no such index.
    virtual void Move(short from, short to);
    // Lays out the subpanes from the first one on; with `invalidate` each is drawn anew.
    virtual void Reposition(short first, unsigned char invalidate);
    // The size of all members together in pixels, 0 without any. Across the axis that from the first one's
    // start to the last one's end, unless they may have different sizes: then that of the largest.
    virtual short ListHeight();
    virtual short ListWidth();
    // Moves one subpane to where the one before it ends. Without effect for one that is in a layout or is no
    // member, and for an index that does not exist.
    virtual void SetMemberBounds(short index);
    // The members, for grids that lay out something else than their subpanes: how many there are, the one at
    // an index, which must exist, the index of one, negative when it is none, and whether a subpane is one.
    virtual short GetNumGridItems();
    virtual GlogPane *GetNthGridItem(short);
    virtual short GetGridItemIndex(GlogPane *);
    virtual bool IsAGridItem(GlogPane *);

    // These only store and lay out nothing. A vertical grid stacks downward, another one runs to the right.
    bool IsVerticalGrid() const { return verticalGrid; }
    void SetVerticalGrid(bool vertical) { verticalGrid = vertical; }
    // Whether the size across the axis has to be measured over all members. At first false.
    bool GetMayHaveDifferentSizes() { return mayHaveDifferentSizes; }
    void SetMayHaveDifferentSizes(bool may) { mayHaveDifferentSizes = may; }

    // How large a grid may become; pixels.
    static short MaxListHeight() { return kMaxListSize; }
    static short MaxListWidth() { return kMaxListSize; }

private:
    static short const kMaxListSize = 32667;

    short ListDimension(bool height, bool measureAll);

    bool verticalGrid;
    bool mayHaveDifferentSizes;
};
