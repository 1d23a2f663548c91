// Takes events from the window system and gives them to glogs.
#pragma once
#include "desktop/windows/IdleChores.h"
#include "desktop/windows/InputEvent.h"
#include "desktop/windows/WindowSystem.h"
#include "host/MouseTask.h"
#include <functional>
#include <list>
#include <memory>
#include <vector>

class Desktop;
class DrawingPort;
class Glog;
class HelpTagWindow;

// One for the life of the desktop. The main loop and every nested one wait here: a wait blocks on the window
// system's queue, keeps all windows drawn, and runs the chores that come due. Events that a nested loop has
// no use for wait for the main loop.
class EventLoop {
public:
    typedef std::function<bool()> Condition;

    EventLoop(Desktop &, WindowSystem &);
    ~EventLoop();
    static EventLoop &Instance(); // of the open desktop
    static EventLoop *Open();     // null without one

    // Handles events until `seconds` have passed (negative: until the loop is told to quit). False once it
    // was.
    bool Run(double seconds);
    void Quit(int status);
    void Restart() { quitting = false; }
    bool IsQuitting() const { return quitting; }
    int Status() const { return status; }

    // Tracking. Points are in the window of the press, in window coordinates.
    bool IsTracking() const { return heldWindow != nullptr; }
    PlatformWindow *HeldWindow() const { return heldWindow; }
    // Blocks until the pointer has moved or the button is up; true while it is down. A negative limit is
    // none. While `rests` is true the limit does not end the wait; after that the next multiple of it does.
    bool NextDragPoint(double limit, Point &where, double &when, bool &timedOut,
                       Condition const &rests = nullptr);
    bool ButtonStillDown();
    PlatformWindow *WindowOf(DrawingPort &) const; // null for a port without window

    // An open menu takes all input, of every window, until EndMenu, and before that what has waited for the
    // main loop. The mouse is captured for the window that it belongs to.
    void BeginMenu(PlatformWindow *);
    // The next event of mouse, keyboard or windows; what it means to the window itself has been done. False
    // when the deadline has passed (negative: none), or the menu is over.
    bool NextMenuEvent(double deadline, InputEvent &);
    // Its window has gone, or the loop was told to quit.
    bool MenuIsOver() const { return quitting || !menuWindow; }
    void EndMenu();

    // What CrsrMain asks for.
    void ShowCursor(int cursor);
    // While a pane is asked for the cursor under the mouse: it shows at the end, and is an arrow where the
    // pane has not asked for one.
    class CursorChoice {
    public:
        explicit CursorChoice(EventLoop &);
        ~CursorChoice();
        CursorChoice(CursorChoice const &) = delete;
        CursorChoice &operator=(CursorChoice const &) = delete;

    private:
        friend class EventLoop;
        EventLoop &loop;
        CursorChoice *outer; // panes may wait while they are asked
        int cursor = Cursors::kArrow;
    };

    // A modal window: handles events until the function says that it is over, or the loop is told to quit.
    // What tracks the mouse, or is an open menu, ends. Chores may have to wait meanwhile.
    void RunModal(Condition const &isOver, bool runChores);

    void Pause(double seconds);
    void PauseUntilKeyUp(int key);

    double LastEventTime() const;
    bool LastPressWasDouble() const { return lastPressClicks == 2; }
    int LastPressClicks() const { return lastPressClicks; }
    void WindowShown(PlatformWindow *); // is about to be, which will activate it
    void WindowHidden(PlatformWindow *);
    void WindowGone(PlatformWindow *);

    WindowSystem &Windows() { return windows; }
    IdleChores &Chores() { return chores; }
    HelpTagWindow &HelpTags() { return *helpTags; }

private:
    void RunIdleWork();
    bool MainLoopIsOver(double deadline) const;
    // Takes one event, or none when the time is over. With a condition also none once that holds, or the loop
    // was told to quit. Draws what is damaged before it blocks.
    bool Take(InputEvent &, double deadline, WindowSystem::Waiter, char const *what,
              Condition const &isOver = nullptr);
    // In a nested loop: window events are handled, pointer events go to `pointer`, everything else waits for
    // the main loop.
    void Sort(InputEvent const &);
    bool BelongsToDrag(InputEvent const &) const;
    bool HandleWindowEvent(InputEvent const &);
    void Handle(InputEvent const &);
    void NoteActivation(InputEvent const &);
    void HandlePress(Glog &, InputEvent const &);
    void TakeDeferredDrag();
    void LeaveDrag();
    void ReleasePointer();

    Desktop &desktop;
    WindowSystem &windows;
    IdleChores chores;
    std::unique_ptr<HelpTagWindow> helpTags;
    std::list<InputEvent> deferred; // for the main loop
    std::list<InputEvent> pointer;  // for tracking
    PlatformWindow *heldWindow = nullptr;
    PlatformWindow *menuWindow = nullptr; // that the open menu belongs to
    Point lastPoint{0, 0};
    double activatedAt = -1000;
    PlatformWindow *activatedWindow = nullptr; // at that time; null when it was shown then
    PlatformWindow *shownWindow = nullptr;     // and has not been activated since
    double shownAt = 0;
    int lastPressClicks = 0;
    CursorChoice *choice = nullptr; // that is being made, or null
    int choresPaused = 0;           // by so many modal windows
    bool quitting = false;
    int status = 0;
};
