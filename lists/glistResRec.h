// The record of a list.
#pragma once
#include "host/Geometry.h"

// How a list's rows are selected. Other numbers select nothing.
enum GListSelectionMode : int {
    kListSelectOne = 0,     // one row
    kListSelectNothing = 1, // a record with it makes kListSelectSeveral; SetSelMode takes it as it stands
    kListSelectSeveral = 2, // several, with command and shift
    kListSelectToggle = 3,  // several, where a click toggles; option clears first, command selects all first
    kListSelectByCode = 4   // no selection by the mouse
};

// The XML keys stand beside the fields.
struct glistResRec {
    static short const kType = 4; // tells records of lists from others; the list does not read it

    // Which of its sides follow the glog's.
    enum AutoEdge { kNoEdge = 0, kBottomFollows = 1, kRightFollows = 2, kBothFollow = 3 };
    // Framed with an inner shadow, or small; others look like the first, without frame.
    enum Style { kDialogStyle = 0, kSmallStyle = 1 };

    short type;       // kType
    Rect bounds;      // "BoundsRect"
    short scrollItem; // "ScrollItem": the bar in the glog, from 1 as GetGlogItem has it; below 1 none
    GListSelectionMode selMode; // "SelMode"
    short lineHeight;           // "LineHeight": pixels of a row
    short firstLineOffset;      // "FirstLineOffset": pixels above the first row
    short edgeH;                // "EdgeH": pixels to the glog's right side, when the right side follows it
    short edgeV;                // "EdgeV": pixels to the glog's bottom, when the bottom follows it
    short selKeyMask;           // "SelKeyMask": modifiers that keep a click from selecting
    bool selReturn;             // "SelReturn": the end of a selecting click is reported
    int autoEdge;               // "AutoEdge": AutoEdge
    int style;                  // "Style": Style; framed with an inner shadow, or small
};
static_assert(sizeof(glistResRec) == 36, "lies in binary resources as it stands");
