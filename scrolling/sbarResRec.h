// The record of a scroll bar.
#pragma once
#include "host/Geometry.h"

// Field after field, without gaps. The XML keys stand beside the fields.
struct sbarResRec {
    static short const kType = 2; // tells records of bars from others; the bar does not read it

    short type;  // kType
    short flags; // "Flags": see ScrollBarPane
    Rect bounds; // "BoundsRect"
    short edgeH; // "EdgeH": pixels from the bar's right side to the glog's, with kRightFollowsGlog
    short edgeV; // "EdgeV": pixels from the bar's bottom to the glog's, with kBottomFollowsGlog
};
