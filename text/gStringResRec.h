// The binary record of a label.
#pragma once
#include "host/Geometry.h"
#include <cstddef>

// The comments name the XML keys that hold the same values. The text is not in the record.
struct gStringResRec {
    enum { kKind = 9 };
    enum { kAlignLeft = 0, kAlignRight = 1, kAlignCenter = 2 };

    short kind;              // kKind; the reader does not look at it
    Point anchor;            // "Origin"
    unsigned char font;      // "FSRID": index in the application's font table
    unsigned char alignment; // "Align": one of the three; any other value counts as left
    short reserved;          // 0
};

static_assert(sizeof(gStringResRec) == 10, "gStringResRec has the layout of its resource");
static_assert(offsetof(gStringResRec, anchor) == 2 && offsetof(gStringResRec, font) == 6 &&
                  offsetof(gStringResRec, alignment) == 7 && offsetof(gStringResRec, reserved) == 8,
              "gStringResRec has the layout of its resource");
