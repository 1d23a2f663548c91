// The record of a pop-up menu.
#pragma once
#include "host/Geometry.h"

// Field after field, without gaps. The XML keys stand beside the fields.
struct popMMResRec {
    static short const kKind = 43; // tells records of pop-up menus from others; the pane does not read it

    short kind;   // kKind
    short flags;  // "Flags": 2 for no check mark at the current item
    Rect bounds;  // "BoundsRect"
    short menuID; // "MenuID": the stored menu that the pane takes a copy of
};
