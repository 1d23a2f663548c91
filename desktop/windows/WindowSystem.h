// The seam between the desktop and whatever shows its windows.
#pragma once
#include "desktop/windows/InputEvent.h"
#include "desktop/windows/PlatformWindow.h"
#include <memory>
#include <string>

// One clock, one queue of events, some windows. Two implementations: SdlWindowSystem shows real windows,
// SimulatedWindowSystem keeps them in memory and takes its events from a script.
class WindowSystem {
public:
    virtual ~WindowSystem() {}
    virtual char const *Name() const = 0;

    virtual std::unique_ptr<PlatformWindow>
    CreateWindow(WindowSpec const &) = 0; // throws std::runtime_error with the reason
    // Whether pop-up windows come where they are asked for; without, menus are drawn over their windows.
    virtual bool PlacesPopups() const { return true; }

    // Who waits, for the message of a wait that nothing can end, and what may end it.
    enum class Waiter {
        kMainLoop, // without more events the simulated system asks the loop to quit
        kTracking, // without more events a held mouse button is released
        kAsking,   // wants what has happened only; in a script movements take time, and have not happened yet
        kPause,    // has a timeout of its own
        kModal     // a dialog or menu: a wait that nothing can end is an error
    };
    // Takes the next event. Blocks until there is one, or until `timeout` seconds have passed (negative: for
    // ever); false then. The simulated system throws ScriptError, naming `what`, when a modal wait could
    // never end.
    virtual bool WaitEvent(InputEvent &, double timeout, Waiter, char const *what) = 0;

    // No event will ever come; a real window system never knows that.
    virtual bool AtEnd() const { return false; }

    virtual double Now() const = 0;                   // seconds, never backwards
    virtual bool IsMouseDown() const = 0;             // primary button, as of the last event taken
    virtual bool IsKeyPressed(int keyCode) const = 0; // as of the last event taken
    virtual unsigned short CurrentModifiers() const = 0;
    // Last known pointer position in the window's content coordinates.
    virtual Point MousePlace(PlatformWindow const &) const = 0;
    virtual void CaptureMouse(PlatformWindow *) = 0; // null ends the capture

    // The scale of all windows from now on, instead of their displays'.
    virtual void ForceScale(double factor) = 0;
    virtual void SetCursor(int cursor) = 0;     // resource number, or one of Cursors
    virtual std::string GetClipboardText() = 0; // UTF-8
    virtual void SetClipboardText(std::string const &utf8) = 0;
    virtual Rect ScreenBounds() const = 0; // logical pixels, of the display with the main window
};

// Cursor numbers of the desktop's own, beside the resource numbers that panes use.
namespace Cursors {
enum Number { kArrow = 0, kText = 1, kHand = 2 };
}
