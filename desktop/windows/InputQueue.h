// The events of a window system that wait to be taken.
#pragma once
#include "desktop/windows/InputEvent.h"
#include <deque>

// First in, first out; what makes an earlier event pointless takes its place, so that a slow program is never
// behind by more than one redraw.
class InputQueue {
public:
    // A mouse move takes the place of one directly before it in the same window, never of one before a
    // button, key or wheel event. A resize, move or exposure removes earlier ones of its kind in the same
    // window, wherever they are.
    void Push(InputEvent const &);
    // False when there is none.
    bool Pop(InputEvent &);
    bool Empty() const { return events.empty(); }
    // Whether something waits, and no event that is still to come could take the place of any of it.
    bool HasOnlyLasting() const;
    // Whether a release of a mouse button waits, for the window.
    bool HasRelease(PlatformWindow const *) const;
    // The event pushed last, while it waits; null otherwise.
    InputEvent *Last();
    // Removes the events of the window, which is about to be destroyed. Releases of keys and buttons stay,
    // without a window: what was held down is held no longer.
    void Forget(PlatformWindow const *);

private:
    std::deque<InputEvent> events;
};
