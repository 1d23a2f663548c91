#include "desktop/windows/SdlEventFilter.h"
#include <X11/Xlibint.h>

static int const kTypeMask = 0x7F; // the bit above says that another program made it

typedef Bool (*Reader)(Display *, XEvent *, xEvent *);

static Reader theReaders[LASTEvent] = {}; // Xlib's own
static SdlEventFilter::Filter theFilters[LASTEvent] = {};

static Bool Read(Display *display, XEvent *event, xEvent *sent) {
    int const type = sent->u.u.type & kTypeMask;
    return theReaders[type](display, event, sent) && theFilters[type](*event) ? True : False;
}

// The readers of another connection are the same.
void SdlEventFilter::Set(Display *display, int type, Filter filter) {
    theFilters[type] = filter;
    Reader const before = XESetWireToEvent(display, type, Read);
    if (before != Read)
        theReaders[type] = before;
}
