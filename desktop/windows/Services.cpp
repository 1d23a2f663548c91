#include "host/Services.h"
#include "desktop/drawing/DrawingPort.h"
#include "desktop/drawing/Region.h"
#include "desktop/windows/EventLoop.h"
#include "desktop/windows/PlatformConventions.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include <cmath>

namespace {

// A place in one window, in the coordinates of the current port, which may be another window's.
Point LocalToPort(Point place, PlatformWindow const *window) {
    DrawingPort *port = DrawingPort::CurrentPort();
    if (!port)
        return place;
    PlatformWindow const *const target = EventLoop::Instance().WindowOf(*port);
    int h = place.h - port->OriginH(), v = place.v - port->OriginV();
    if (window && target && window != target) {
        h += window->ScreenPlace().h - target->ScreenPlace().h;
        v += window->ScreenPlace().v - target->ScreenPlace().v;
    }
    return {static_cast<short>(v), static_cast<short>(h)};
}

bool NextPoint(double limit, Point *where, double *when, bool &timedOut,
               std::function<bool()> const &rests = nullptr) {
    Point place;
    double time = 0;
    PlatformWindow const *const window = EventLoop::Instance().HeldWindow();
    if (!EventLoop::Instance().NextDragPoint(limit, place, time, timedOut, rests))
        return false;
    // With no movement the position stays what the caller has.
    if (where && !timedOut)
        *where = LocalToPort(place, window);
    if (when)
        *when = time;
    return true;
}

double Limit(double seconds) { return std::isfinite(seconds) && seconds > 0 ? seconds : 0; }

} // namespace

bool OS::Services::StillDown() { return EventLoop::Instance().ButtonStillDown(); }

void OS::Services::GetMouse(::Point *where) {
    EventLoop &loop = EventLoop::Instance();
    DrawingPort *port = DrawingPort::CurrentPort();
    PlatformWindow *window = port ? loop.WindowOf(*port) : nullptr;
    if (window)
        *where = LocalToPort(loop.Windows().MousePlace(*window), window);
}

bool OS::Services::ScrollArrowsTogetherAtEnd() { return PlatformConventions::scrollArrowsTogetherAtEnd; }

bool OS::Services::ShowsGrowBoxes() { return PlatformConventions::showsGrowBoxes; }

bool MouseIsDragging(Point *where, double *when) {
    bool timedOut = false;
    return NextPoint(-1, where, when, timedOut);
}

bool MouseIsDraggingWithTimeout(double seconds, Point *where, double *when, MouseTracking::Result *result) {
    bool timedOut = false;
    bool const down = NextPoint(Limit(seconds), where, when, timedOut);
    if (result)
        *result = timedOut ? MouseTracking::kTimedOut : MouseTracking::Result(0);
    return down;
}

bool MouseIsDraggingUnlessAtRest(double seconds, Point *where, std::function<bool()> const &rests) {
    bool timedOut = false;
    return NextPoint(Limit(seconds), where, nullptr, timedOut, rests);
}

void Yield(double seconds) { EventLoop::Instance().Pause(std::isfinite(seconds) ? seconds : 0); }

void YieldUntilKeyUp(unsigned int key) { EventLoop::Instance().PauseUntilKeyUp(static_cast<int>(key)); }

KeybdMgr &KeybdMgr::Instance() {
    static KeybdMgr manager;
    return manager;
}

bool KeybdMgr::IsKeyPressed(int key) { return EventLoop::Instance().Windows().IsKeyPressed(key); }

double TarnSystemTime::GetCurrentEventTime() {
    EventLoop *loop = EventLoop::Open();
    return loop ? loop->Windows().Now() : 0;
}

void CrsrMain(short cursor) {
    if (WithCursorDispatchingDisabled::fgCount > 0)
        return;
    if (EventLoop *loop = EventLoop::Open())
        loop->ShowCursor(cursor);
}

// This desktop makes its drag images from what a window shows and never draws panes for them.
bool CurrentlyDrawingForDragAndDrop() { return false; }

void HelpResizeObject(Rect *oldBox, Rect *newBox) {
    OSRgn before(*oldBox), after(*newBox), gone = before;
    Region::Subtract(gone, after);
    Region::Subtract(after, before);
    Region::Unite(gone, after);
    for (Rect const &r : Region::Rects(gone))
        VelaDrawing::InvalRect(&r);
}
