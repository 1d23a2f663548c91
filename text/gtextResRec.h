// The binary record of a text field.
#pragma once
#include "host/Geometry.h"
#include "host/UString.h"
#include <cstddef>

// The comments name the XML keys that hold the same values.
struct gtextResRec {
    enum { kKind = 8 };
    enum Flag : unsigned char { // of `flags`
        kBoxIt = 0x01,
        kNoTabIn = 0x02,
        kRetOnClick = 0x04,
        kRetOnModify = 0x08,
        kMultiLine = 0x10,
        kAutoScroll = 0x20,
        kNotSelectable = 0x40,
        kUseSavedColors = 0x80
    };
    enum MoreFlag : unsigned char { kReadOnly = 0x01 }; // of `moreFlags`

    short kind;              // kKind; the reader does not look at it
    Rect bounds;             // "BoundsRect"
    unsigned char font;      // "FSRID"
    unsigned char alignment; // "Align"
    unsigned char flags;     // "BoxIt" and so on, as Flag names them
    unsigned char moreFlags; // "ReadOnly"
    signed char textWell;    // "TextWell"
    short frameOffset;       // "FrameOffset"
    short firstLineOffset;   // "FirstLineOffset"
    UString initialText;     // "InitTextID"

    // Of a record without any value.
    gtextResRec()
        : kind(kKind)
        , bounds()
        , font(0)
        , alignment(0)
        , flags(0)
        , moreFlags(0)
        , textWell(0)
        , frameOffset(0)
        , firstLineOffset(0) {}
};
