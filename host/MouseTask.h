// Following the mouse while its button is down.
#pragma once
#include "host/Geometry.h"

namespace MouseTracking {

// How the last wait for the mouse has ended. Values other than kTimedOut (the time ran out without a
// movement) mean nothing to tasks.
enum Result { kTimedOut = 8 };
} // namespace MouseTracking

// What a pane does with a drag. Made on the stack and run by GlogPane::TrackMouse, which returns when the
// button is up. All points are in the coordinates of the pane that runs the task.
class MouseTask {
public:
    // The number is 0 and means nothing.
    explicit MouseTask(int);
    virtual ~MouseTask();
    // Called once, before anything else.
    virtual void MouseTaskBegin() = 0;
    // Called for every new position while the button is down, and with the old one whenever the sleep time
    // has passed without a movement.
    virtual void MouseTaskContinue(Point const &) = 0;
    // Called once, at the release. Losing the mouse or the window counts as a release.
    virtual void MouseTaskEnd() = 0;
    // Waits for the next position; false once the button is up. Tasks leave this alone.
    virtual bool MouseIsDragging(Point &);
    // Where the button went down.
    Point GetStartPoint() const;
    // How the wait before the current MouseTaskContinue has ended.
    MouseTracking::Result GetTrackingResult() const;
    // Seconds between two steps of scrolling while the mouse is held beyond an edge.
    static double DefaultAutoScrollTime();

protected:
    // Sets the seconds between two calls of MouseTaskContinue while the mouse rests. Called in the
    // constructor or in MouseTaskBegin; without it the mouse has to move.
    void SetSleepTime(double const &seconds);

private:
    friend class GlogPane;
    Point startPoint;
    double sleepTime;
    MouseTracking::Result trackingResult;
};

// An older kind of task, which nothing makes any more.
class OldMouseTask;
