// The binary record of a group of check boxes or radio buttons.
#pragma once
#include <cstddef>

// The comments name the XML keys that hold the same values. The buttons are not in the record: whoever makes
// a group from one adds them.
struct ckRadItemResRec {
    enum { kRadioKind = 53, kCheckKind = 54 };

    short kind;           // one of the two; the reader does not look at it
    unsigned short flags; // "Flags": as CheckBoxPane has them
};

static_assert(sizeof(ckRadItemResRec) == 4, "ckRadItemResRec has the layout of its resource");
static_assert(offsetof(ckRadItemResRec, flags) == 2, "ckRadItemResRec has the layout of its resource");
