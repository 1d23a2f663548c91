#include "desktop/windows/EventLoop.h"
#include "desktop/Desktop.h"
#include "desktop/panes/DesktopRep.h"
#include "desktop/panes/Glog.h"
#include "desktop/panes/HostCall.h"
#include "desktop/panes/ModalRun.h"
#include "desktop/panes/PortKeeper.h"
#include "desktop/windows/HelpTagWindow.h"
#include <algorithm>
#include <cmath>

namespace {

EventLoop *theLoop = nullptr;

// An activation so soon before a press came from that press.
double const kActivatingPressWindow = 0.25;
// And one so soon after a window was shown came from that.
double const kActivatingShowWindow = 1.0;

bool IsRelease(InputEvent const &event) { return event.kind == InputEvent::kMouseUp && event.button == 1; }

// What a menu takes while it is open.
bool IsInput(InputEvent::Kind kind) {
    return kind == InputEvent::kMouseDown || kind == InputEvent::kMouseUp || kind == InputEvent::kMouseMove ||
           kind == InputEvent::kWheel || kind == InputEvent::kKeyDown || kind == InputEvent::kTextInput;
}

bool Drags(InputEvent const &event) { return event.kind == InputEvent::kMouseMove || IsRelease(event); }

} // namespace

EventLoop::EventLoop(Desktop &desktop_, WindowSystem &windows_)
    : desktop(desktop_)
    , windows(windows_)
    , helpTags(new HelpTagWindow(windows_)) {
    theLoop = this;
}

EventLoop::~EventLoop() { theLoop = nullptr; }

EventLoop &EventLoop::Instance() { return *theLoop; }

EventLoop *EventLoop::Open() { return theLoop; }

void EventLoop::Quit(int status_) {
    quitting = true;
    status = status_;
}

double EventLoop::LastEventTime() const { return windows.Now(); }

// What an application does between events. It may prepare other panes, close windows, or end the loop.
void EventLoop::RunIdleWork() {
    HostCall const call;
    PortKeeper const keeper;
    double const now = windows.Now();
    if (!choresPaused)
        chores.Run(now);
    helpTags->Tick(now);
    DesktopRep::Of(desktop).Idle();
    DesktopRep::Of(desktop).UpdateAll();
}

// Nothing can come that the main loop would have to wait for.
bool EventLoop::MainLoopIsOver(double deadline) const {
    return quitting || !DesktopRep::Of(desktop).AnyVisible() || (deadline < 0 && windows.AtEnd());
}

bool EventLoop::Take(InputEvent &event, double deadline, WindowSystem::Waiter waiter, char const *what,
                     Condition const &isOver) {
    for (;;) {
        RunIdleWork();
        if (isOver && (quitting || isOver()))
            return false;
        if (waiter == WindowSystem::Waiter::kMainLoop && MainLoopIsOver(deadline))
            return false;
        double const now = windows.Now();
        double limit = deadline < 0 ? -1 : std::max(0.0, deadline - now);
        // Where nobody is left who could answer, chores that come again and again must not keep a dialog or
        // menu waiting for ever.
        bool const nobodyAnswers = waiter == WindowSystem::Waiter::kModal && deadline < 0 && windows.AtEnd();
        for (double next : {choresPaused ? -1.0 : chores.UntilNext(now), helpTags->UntilNext(now)})
            if (next >= 0 && (limit < 0 || next < limit) && !nobodyAnswers)
                limit = next;
        if (windows.WaitEvent(event, limit, waiter, what))
            return true;
        if (quitting || (deadline >= 0 && windows.Now() >= deadline))
            return false;
        // A drag ends with its window, which something that ran here may have closed.
        if ((waiter == WindowSystem::Waiter::kTracking || waiter == WindowSystem::Waiter::kAsking) &&
            !heldWindow)
            return false;
    }
}

bool EventLoop::Run(double seconds) {
    double const deadline = seconds < 0 ? -1 : windows.Now() + seconds;
    while (!quitting) {
        InputEvent event;
        bool taken = true;
        if (!deferred.empty()) {
            event = deferred.front();
            deferred.pop_front();
        } else {
            taken = Take(event, deadline, WindowSystem::Waiter::kMainLoop, "the main loop");
        }
        if (taken) {
            HostCall const call;
            Handle(event);
        }
        if (!HostCall::Running()) {
            DesktopRep::Of(desktop).DeleteDisposed();
            LeaveDrag();
        }
        if (!taken || !DesktopRep::Of(desktop).AnyVisible())
            break;
    }
    RunIdleWork(); // what the last event changed shows
    return !quitting && DesktopRep::Of(desktop).AnyVisible();
}

void EventLoop::Handle(InputEvent const &event) {
    if (HandleWindowEvent(event))
        return;
    Glog *glog = DesktopRep::Of(desktop).GlogOf(event.window);
    switch (event.kind) {
    case InputEvent::kMouseUp:
        if (event.button == 1)
            ReleasePointer();
        break;
    case InputEvent::kQuit:
        Quit(0);
        break;
    default:
        break;
    }
    if (ModalRun *const modal = ModalRun::Innermost(); modal && modal->Takes(event, glog))
        return;
    if (!glog || glog->disposed)
        return;
    switch (event.kind) {
    case InputEvent::kMouseDown:
        HandlePress(*glog, event);
        break;
    case InputEvent::kMouseMove:
        glog->PointerMoved({static_cast<short>(event.v), static_cast<short>(event.h)});
        break;
    case InputEvent::kMouseLeave:
        glog->PointerLeft();
        break;
    case InputEvent::kWheel:
        helpTags->Hide();
        glog->Wheel(event);
        break;
    case InputEvent::kKeyDown:
    case InputEvent::kTextInput:
        helpTags->Hide();
        glog->KeyDown(event);
        break;
    case InputEvent::kTextEditing:
        glog->ComposeText(event);
        break;
    case InputEvent::kCloseRequested:
        DisposeGlog(glog);
        break;
    default:
        break;
    }
}

// What concerns the window itself is handled at once, in nested loops too.
bool EventLoop::HandleWindowEvent(InputEvent const &event) {
    Glog *glog = DesktopRep::Of(desktop).GlogOf(event.window);
    switch (event.kind) {
    case InputEvent::kResized:
        if (glog)
            glog->Resized(event.width, event.height);
        return true;
    case InputEvent::kExposed:
        if (glog)
            glog->PresentAll();
        else
            helpTags->Exposed(event.window);
        return true;
    case InputEvent::kActivated:
        NoteActivation(event);
        if (glog)
            glog->Activation(true);
        return true;
    case InputEvent::kDeactivated:
        helpTags->Hide();
        if (glog)
            glog->Activation(false);
        if (event.window == heldWindow) {
            InputEvent release = event;
            release.kind = InputEvent::kMouseUp;
            release.button = 1;
            release.h = lastPoint.h;
            release.v = lastPoint.v;
            pointer.push_back(release);
        }
        return true;
    case InputEvent::kScaleChanged:
        if (glog)
            glog->SetScale(DeviceScale(event.scale));
        return true;
    case InputEvent::kMoved:
        helpTags->Hide();
        return true;
    default:
        return false;
    }
}

void EventLoop::NoteActivation(InputEvent const &event) {
    bool const byShowing = event.window == shownWindow && event.time - shownAt < kActivatingShowWindow;
    shownWindow = nullptr;
    activatedWindow = byShowing ? nullptr : event.window;
    activatedAt = event.time;
}

void EventLoop::WindowShown(PlatformWindow *window) {
    shownWindow = window;
    shownAt = windows.Now();
}

void EventLoop::HandlePress(Glog &glog, InputEvent const &event) {
    helpTags->Hide();
    // A window manager may give the activation before the press or after it.
    glog.SetActivatedByMouseDown(!glog.IsActive() || (event.window == activatedWindow &&
                                                      event.time - activatedAt < kActivatingPressWindow));
    activatedAt = -1000;
    lastPressClicks = event.clicks;
    if (event.button == 1) {
        heldWindow = event.window;
        lastPoint = {static_cast<short>(event.v), static_cast<short>(event.h)};
        pointer.clear();
        TakeDeferredDrag();
        windows.CaptureMouse(event.window);
    }
    // What a pane leaves of the drag, the release before all, is the main loop's, even when the pane throws.
    struct Rest {
        ~Rest() {
            loop.LeaveDrag();
            glog.SetActivatedByMouseDown(false);
        }
        EventLoop &loop;
        Glog &glog;
    } const rest{*this, glog};
    glog.Click(event);
}

// A loop inside a pane keeps movements and the release for the drag that it takes place in. Where nobody
// follows the mouse, they are the main loop's. Must not throw: it may be memory that the pane has thrown for.
void EventLoop::LeaveDrag() { deferred.splice(deferred.begin(), pointer); }

void EventLoop::ReleasePointer() {
    if (!heldWindow)
        return;
    heldWindow = nullptr;
    windows.CaptureMouse(nullptr);
}

void EventLoop::WindowHidden(PlatformWindow *window) {
    if (!window)
        return;
    auto isHidden = [=](InputEvent const &event) { return event.window == window; };
    pointer.remove_if(isHidden);
    // A press that waits goes too: its release may never come.
    deferred.remove_if([=](InputEvent const &event) {
        return isHidden(event) && (event.kind == InputEvent::kMouseDown || Drags(event));
    });
    if (menuWindow == window)
        menuWindow = nullptr;
    if (heldWindow == window)
        ReleasePointer(); // which ends the drag
    helpTags->OwnerGone(window);
}

void EventLoop::WindowGone(PlatformWindow *window) {
    if (!window)
        return;
    WindowHidden(window);
    deferred.remove_if([=](InputEvent const &event) { return event.window == window; });
    if (activatedWindow == window)
        activatedWindow = nullptr;
    if (shownWindow == window)
        shownWindow = nullptr;
}

PlatformWindow *EventLoop::WindowOf(DrawingPort &port) const {
    for (Glog *glog : DesktopRep::Of(desktop).Glogs())
        if (&glog->Port() == &port)
            return glog->Window();
    return nullptr;
}

// Nested loops

// What follows the release belongs to the next press, which waits too.
bool EventLoop::BelongsToDrag(InputEvent const &event) const {
    bool const released = !pointer.empty() && IsRelease(pointer.back());
    return heldWindow && !released && Drags(event);
}

void EventLoop::Sort(InputEvent const &event) {
    PortKeeper const keeper;
    if (HandleWindowEvent(event))
        return;
    if (menuWindow && IsInput(event.kind)) {
        pointer.push_back(event); // an open menu takes it when it has its turn again
        return;
    }
    if (BelongsToDrag(event))
        pointer.push_back(event);
    else if (event.kind == InputEvent::kMouseMove && !deferred.empty() &&
             deferred.back().kind == InputEvent::kMouseMove && deferred.back().window == event.window)
        deferred.back() = event;
    else
        deferred.push_back(event);
}

// A press that had to wait finds its drag and release waiting behind it.
void EventLoop::TakeDeferredDrag() {
    for (auto i = deferred.begin(); i != deferred.end() && i->kind != InputEvent::kMouseDown;) {
        if (!Drags(*i)) {
            ++i;
            continue;
        }
        pointer.push_back(*i);
        i = deferred.erase(i);
        if (IsRelease(pointer.back()))
            return;
    }
}

bool EventLoop::NextDragPoint(double limit, Point &where, double &when, bool &timedOut,
                              Condition const &rests) {
    timedOut = false;
    double const start = windows.Now();
    double deadline = limit < 0 ? -1 : start + limit;
    Condition const isAwake = [&rests] { return !rests(); };
    HostCall const call;
    while (heldWindow) {
        if (pointer.empty()) {
            InputEvent event;
            bool const sleeps = limit > 0 && rests && rests();
            if (Take(event, sleeps ? -1 : deadline, WindowSystem::Waiter::kTracking, "a drag with the mouse",
                     sleeps ? isAwake : nullptr)) {
                Sort(event);
                continue;
            }
            if (quitting || !heldWindow)
                break;
            if (sleeps) {
                deadline = start + limit * (std::floor((windows.Now() - start) / limit) + 1);
                continue;
            }
            timedOut = true;
            where = lastPoint;
            when = windows.Now();
            return true;
        }
        InputEvent const event = pointer.front();
        Point const place{static_cast<short>(event.v), static_cast<short>(event.h)};
        bool const moved = place.v != lastPoint.v || place.h != lastPoint.h;
        // A release elsewhere than the last point tells of a movement first.
        if (event.kind == InputEvent::kMouseMove || !moved)
            pointer.pop_front();
        when = event.time;
        lastPoint = place;
        if (moved) {
            where = place;
            return true;
        }
        if (event.kind == InputEvent::kMouseUp) {
            ReleasePointer();
            return false;
        }
    }
    ReleasePointer();
    return false;
}

bool EventLoop::ButtonStillDown() {
    HostCall const call;
    auto released = [this] { return std::any_of(pointer.begin(), pointer.end(), IsRelease); };
    InputEvent event;
    while (heldWindow && !released() &&
           Take(event, windows.Now(), WindowSystem::Waiter::kAsking, "the state of the mouse button"))
        Sort(event);
    return heldWindow && !released();
}

void EventLoop::ShowCursor(int cursor) {
    if (choice)
        choice->cursor = cursor;
    else
        windows.SetCursor(cursor);
}

EventLoop::CursorChoice::CursorChoice(EventLoop &loop_)
    : loop(loop_)
    , outer(loop_.choice) {
    loop.choice = this;
}

EventLoop::CursorChoice::~CursorChoice() {
    loop.choice = outer;
    loop.ShowCursor(cursor);
}

void EventLoop::BeginMenu(PlatformWindow *window) {
    menuWindow = window;
    helpTags->Hide();
    windows.SetCursor(Cursors::kArrow);
    windows.CaptureMouse(window);
    // What the user did while nobody had time for it was meant for the menu too: the release of a press that
    // waits would come to it, and the press after it had gone.
    for (auto i = deferred.begin(); i != deferred.end();) {
        auto const event = i++;
        if (IsInput(event->kind))
            pointer.splice(pointer.end(), deferred, event);
    }
}

// The release that is still to come is the window's whose press it ends. What the menu has not taken goes
// where it would have gone without one. Must not throw.
void EventLoop::EndMenu() {
    menuWindow = nullptr;
    if (!heldWindow)
        windows.CaptureMouse(nullptr);
    std::list<InputEvent> left;
    left.swap(pointer);
    auto const later = deferred.begin();
    while (!left.empty())
        if (BelongsToDrag(left.front()))
            pointer.splice(pointer.end(), left, left.begin());
        else
            deferred.splice(later, left, left.begin());
}

bool EventLoop::NextMenuEvent(double deadline, InputEvent &event) {
    if (MenuIsOver())
        return false;
    bool const taken = pointer.empty() && Take(event, deadline, WindowSystem::Waiter::kModal, "an open menu",
                                               [this] { return !menuWindow || !pointer.empty(); });
    if (taken) {
        PortKeeper const keeper;
        HandleWindowEvent(event);
    } else if (!MenuIsOver() && !pointer.empty()) {
        event = pointer.front();
        pointer.pop_front();
    } else {
        return false;
    }
    if (event.kind == InputEvent::kCloseRequested || event.kind == InputEvent::kQuit)
        deferred.push_back(event);
    if (IsRelease(event)) {
        // The capture was the press's, which may have ended it; now it is the menu's.
        heldWindow = nullptr;
        windows.CaptureMouse(nullptr);
        windows.CaptureMouse(menuWindow);
    }
    return true;
}

void EventLoop::RunModal(Condition const &isOver, bool runChores) {
    struct PausedChores {
        PausedChores(int &count_, bool on_)
            : count(count_)
            , on(on_ ? 1 : 0) {
            count += on;
        }
        ~PausedChores() { count -= on; }
        int &count;
        int const on;
    } const paused(choresPaused, !runChores);
    menuWindow = nullptr;
    heldWindow = nullptr;
    windows.CaptureMouse(nullptr);
    helpTags->Hide();
    while (!quitting && !isOver()) {
        InputEvent event;
        if (!deferred.empty()) {
            event = deferred.front();
            deferred.pop_front();
        } else if (!Take(event, -1, WindowSystem::Waiter::kModal, "a modal dialog", isOver)) {
            continue;
        }
        Handle(event);
        LeaveDrag(); // of a press in here; what was tracked before has ended
    }
}

void EventLoop::Pause(double seconds) {
    double const deadline = windows.Now() + std::max(0.0, seconds);
    HostCall const call;
    InputEvent event;
    while (!quitting && Take(event, deadline, WindowSystem::Waiter::kPause, "a pause"))
        Sort(event);
}

void EventLoop::PauseUntilKeyUp(int key) {
    HostCall const call;
    InputEvent event;
    while (!quitting && windows.IsKeyPressed(key) &&
           Take(event, -1, WindowSystem::Waiter::kTracking, "the release of a key"))
        if (event.kind != InputEvent::kKeyUp)
            Sort(event);
}
