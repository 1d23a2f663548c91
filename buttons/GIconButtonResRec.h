// The binary record of an icon button.
#pragma once
#include "buttons/GIconResRec.h"

// Follows the fields of an icon pane. The comments name the XML keys that hold the same values.
struct GIconButtonResRec : GIconResRec {
    enum { kKind = 49 };

    short numDownStates;        // "NumDownStates": at least 1
    unsigned char canCancel;    // "CanCancel"
    unsigned char notifyWindow; // "NotifyWindow"
    short cmdClassID;           // "CmdClassID"
    short optCmdClassID;        // "OptCmdClassID"
    short cmdID;                // "CmdID"
    short optCmdID;             // "OptCmdID"
};

static_assert(sizeof(GIconButtonResRec) == 30, "GIconButtonResRec has the layout of its resource");
