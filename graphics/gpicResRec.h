// The record of a picture.
#pragma once
#include "host/Geometry.h"
#include <cstddef>

// The XML keys stand beside the fields.
struct gpicResRec {
    enum { kKind = 10 };

    short kind;                 // kKind; the pane does not look at it
    Rect bounds;                // "BoundsRect"
    unsigned char useImageSize; // "PicUseImageSize": not 0 for a pane as large as its picture; an unused byte
                                // follows
    short pictureID;            // "ResIDName": a picture's number, by name in XML; none from 0 down
};

static_assert(sizeof(gpicResRec) == 14 && offsetof(gpicResRec, bounds) == 2 &&
                  offsetof(gpicResRec, useImageSize) == 10 && offsetof(gpicResRec, pictureID) == 12,
              "gpicResRec has the layout of its resource");
