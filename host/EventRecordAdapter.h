#pragma once
#include "host/Geometry.h"

class EventRecordAdapter {
public:
    EventRecordAdapter() : what(0), message(0), when(0), modifiers(0) { where.v = where.h = 0; }
    virtual ~EventRecordAdapter() {}
    unsigned short what;
    unsigned long long message;
    unsigned int when;
    Point where;
    unsigned short modifiers;
};

bool ShiftEvent(EventRecordAdapter const *);
bool EscapeKey(EventRecordAdapter const *);
bool UpArrowKey(EventRecordAdapter const *);
bool DownArrowKey(EventRecordAdapter const *);
