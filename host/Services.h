// The mouse, the keyboard, time, and how the platform likes its user interface.
#pragma once
#include "host/Geometry.h"
#include "host/MouseTask.h"
#include <functional>

namespace OS {
namespace Services {

// Whether the mouse button is down at this moment.
bool StillDown();
// Writes where the mouse is, in the current port's coordinates.
void GetMouse(::Point *);
// Whether both arrows of a scroll bar stand at its end, instead of one at either end.
bool ScrollArrowsTogetherAtEnd();
// Whether windows have a box in their corner by which they are resized.
bool ShowsGrowBoxes();

} // namespace Services
} // namespace OS

// Waits until the mouse has moved or its button was released. True while the button is down; `where` then
// receives the position in the current port's coordinates and `when` the time in seconds. Either may be null.
// The application runs while this waits: timers, idle chores and updates of other windows.
bool MouseIsDragging(Point *where, double *when);
// The same, but waits no longer than the given seconds. When the time runs out it answers true with the
// position unchanged and the result kTimedOut. The result may be null.
bool MouseIsDraggingWithTimeout(double seconds, Point *where, double *when, MouseTracking::Result *);

// The same for a loop that would do nothing at the end of that time: as long as `rests` is true, and the
// mouse does not move, the program sleeps on. It is asked whenever something else has run meanwhile. Once it
// is false this answers as if it had been called again at the end of each such time.
bool MouseIsDraggingUnlessAtRest(double seconds, Point *where, std::function<bool()> const &rests);

// Lets the application run for the given seconds.
void Yield(double seconds);
// Lets the application run until the key is up. Returns at once when it is.
void YieldUntilKeyUp(unsigned int key);

// Which keys are down.
class KeybdMgr {
public:
    static KeybdMgr &Instance(); // one for the process
    // By character code; false for one that no key has.
    bool IsKeyPressed(int key);
};

namespace TarnSystemTime {

// The time of now in seconds, never running backwards. A tick is 1/60 second: the whole part of 60 times this
// plus 0.5.
double GetCurrentEventTime();

} // namespace TarnSystemTime

// Shows the cursor of the resource number until another is set. An unknown number gives the arrow.
void CrsrMain(short cursor);

// Whether what is being drawn becomes the image of a drag: without selection and decoration.
bool CurrentlyDrawingForDragAndDrop();
// Invalidates what lies in one of the boxes and not in the other, in the current pane's coordinates.
void HelpResizeObject(Rect *oldBox, Rect *newBox);
