// The binary record of a frame button.
#pragma once
#include "host/Geometry.h"
#include <cstddef>

// The comments name the XML keys that hold the same values.
struct gfbResRec {
    enum { kKind = 13 };

    short kind;           // kKind; the reader does not look at it
    Point origin;         // "Origin": top left corner of the button
    short family;         // "ISetID": icon family, by name in XML
    short icon;           // "IconID": index in the family
    Point gutsOrigin;     // "GutsOrigin": top left corner of the icon, from that of the button
    short downOffset;     // "DownOffset": pixels by which the box is larger than the 24 x 16 face
    short hiliteWhenDown; // "HiliteWhenDown": kept, but without effect
};

static_assert(sizeof(gfbResRec) == 18, "gfbResRec has the layout of its resource");
static_assert(offsetof(gfbResRec, origin) == 2 && offsetof(gfbResRec, family) == 6 &&
                  offsetof(gfbResRec, icon) == 8 && offsetof(gfbResRec, gutsOrigin) == 10 &&
                  offsetof(gfbResRec, downOffset) == 14 && offsetof(gfbResRec, hiliteWhenDown) == 16,
              "gfbResRec has the layout of its resource");
