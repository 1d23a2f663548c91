// Tracks a press on something that looks like a button, without a pane: the caller gives a rectangle and a
// procedure that is told each change.
//
// All of these run a loop until the mouse button is released; the application runs on meanwhile. Rectangles
// and points are in the coordinates of the current port.
#pragma once
#include "host/Geometry.h"

// What a tracking procedure is told.
enum TransitionTo : int {      // a procedure has to put up with further values
    kTransitionToIdle = 0,     // the mouse left the rectangle
    kTransitionToPressed = 1,  // the mouse is in the rectangle: sent first, and whenever it comes back
    kTransitionToReleased = 2, // released inside; the last call of a completed press
    kTransitionTick = 3        // still inside, nothing has changed; comes with each pass, for animations
};

typedef void (*TransitionProc)(void *data, enum TransitionTo to); // draws the transition, or acts on it

// Tracks until the release. The press shows for a tenth of a second at least, and while the mouse rests the
// procedure gets a tick fifteen times a second. The procedure gets `data` as it stands here; while the mouse
// is outside it gets nothing. With `reportInside` the result is whether the mouse was inside at the release;
// without it the result is always true, and the procedure alone tells.
bool GenericButtonTrackingLoop(bool reportInside, Rect const *rect, TransitionProc proc, void *data);

// Where the three looks of an icon button stand. All icons are of one family.
struct IconTrackingRec {
    short v, h; // top left corner of the icon
    short family;
    short idleIcon;    // index for kTransitionToIdle
    short pressedIcon; // index for kTransitionToPressed
    short releaseIcon; // index for kTransitionToReleased
};

// The stock procedure: `data` is an IconTrackingRec, whose icon for the transition is drawn. A tick, and any
// other value, draws nothing.
void IconButtonTransitionProc(void *data, enum TransitionTo to);

// Tracks an icon that stands at the rectangle's top left corner, drawing black on white; the former colours
// come back. `proc` gets an IconTrackingRec made of the arguments. Result as GenericButtonTrackingLoop.
// Nothing is invalidated: the icon of the last transition stays.
bool TrackIconButton(bool reportInside, Rect const *rect, short family, short idleIcon, short pressedIcon,
                     short releaseIcon, TransitionProc proc);

// The same with the caller's own record, which stays the caller's. The rectangle is invalidated at the end,
// so that the owner redraws the button from its real state and the release icon shows only for a moment.
bool TrackSpecialIconButton(bool reportInside, Rect const *rect, IconTrackingRec *rec, TransitionProc proc);
