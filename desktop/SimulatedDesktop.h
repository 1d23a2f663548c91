// A desktop without display: events from a script, time that only waiting moves, windows in memory.
#pragma once
#include "desktop/Desktop.h"
#include "host/Geometry.h"
#include <stdexcept>
#include <string>
#include <vector>

class Surface;

// A script that cannot be read or cannot go on; the message names script and line.
class ScriptError : public std::runtime_error {
public:
    explicit ScriptError(std::string const &what)
        : std::runtime_error(what) {}
};

// Drives and photographs dialogs. Script steps, one a line, `#` starts a comment; places are window
// coordinates, h then v; any of shift, command, option and control may follow the place:
//
//     press 120 40 shift      move 130 44       release
//     click 120 40            doubleclick 120 40     rightclick 120 40
//     wheel 120 40 0 -1       # horizontal and vertical notches
//     click @3                # the middle of item 3, in any step with a place
//     press @3+20+8           # 20 right and 8 below the top left corner of item 3
//     key Return              key a command     type "héllo"
//     compose "nih" 2         # what an input method composes, its caret so far in; "" gives it up
//     wait 0.5                resize 640 480    activate off
//     menu 3                  # chooses item 3 of the open pop-up menu; 0 dismisses it
//     menu 4/2                # item 2 of the submenu that item 4 opens
//     print list.pdf          snapshot a.png    dump a.json
//
// An item that is not there or does not show is an error, and so is a press outside of the window while no
// menu is open. Steps are taken when something waits for events, nested loops too; `wait` lets virtual time
// pass first. When the script has ended, a tracking loop gets its release and Run returns.
class SimulatedDesktop : public Desktop {
public:
    explicit SimulatedDesktop(DesktopOptions const & = DesktopOptions());
    virtual ~SimulatedDesktop();

    // Appends steps to the script; throws ScriptError and appends nothing when one of them is wrong.
    void Script(std::string const &steps, std::string const &name = "script");
    // Script, then runs until the script has ended.
    void Play(std::string const &steps);
    double Now() const; // virtual seconds since the desktop was opened

    // What was recorded since the last call of the same function. Recording begins with the first call.
    std::vector<std::string> TakeMessages();
    std::vector<std::string> TakeDrawing();

    // The window's pixels as presented so far; null while it is hidden.
    Surface const *Picture(glogRec *) const;
    // Pixels presented since the last call, as rectangles in logical pixels.
    std::vector<Rect> TakePresented(glogRec *);

private:
    std::vector<std::string> messages, drawing;
    bool recordsMessages = false, recordsDrawing = false;
};
