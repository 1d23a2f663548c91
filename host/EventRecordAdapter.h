// A press of the mouse or of a key.
#pragma once
#include "host/Geometry.h"

// One event, made by the host and valid for the call that it is given to; may be copied.
class EventRecordAdapter {
public:
    EventRecordAdapter()
        : what(0)
        , message(0)
        , when(0)
        , modifiers(0) {
        where.v = where.h = 0;
    }
    virtual ~EventRecordAdapter() {}

    unsigned short what;        // the kind of event
    unsigned long long message; // of a key event: the character code in the low byte; 13 is return, 3 enter
    unsigned int when;          // ticks of 1/60 second
    Point where;                // the pointer, in the coordinates of the pane that gets the event
    unsigned short modifiers;   // 0x0100 command, 0x0200 shift, 0x0800 option, 0x1000 control
};

// Whether the shift key was down; false for null.
bool ShiftEvent(EventRecordAdapter const *);
// Whether a key event is that of the key; false for null.
bool EscapeKey(EventRecordAdapter const *);
bool UpArrowKey(EventRecordAdapter const *);
bool DownArrowKey(EventRecordAdapter const *);
