// What becomes of the events that the X server sends before SDL sees them.
#pragma once
#include <X11/Xlib.h>

namespace SdlEventFilter {

// Whether there is to be such an event at all; it may have been changed meanwhile. Called by Xlib within its
// locks, while it reads: nothing may be asked of the server or sent to it there.
typedef bool (*Filter)(XEvent &);

// From now on every event of the connection that has the type goes through the filter, and no other one.
void Set(Display *, int type, Filter);

} // namespace SdlEventFilter
