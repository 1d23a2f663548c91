// The record of a grow box.
#pragma once
#include "host/Geometry.h"

// Field after field, without gaps. The XML keys stand beside the fields.
struct growResRec {
    static short const kKind = 3; // tells records of grow boxes from others; the box does not read it

    short kind;               // kKind
    Rect limits;              // "LimitsRect": the window's least width and height (left, top), its greatest
                              // (right, bottom)
    unsigned char borderLeft; // "BorderLeft": not 0 for a line down the left side
    unsigned char borderTop;  // "BorderTop": not 0 for a line along the top
    int color;                // "Color": 1 or 2 for a box without lines on another ground
};
