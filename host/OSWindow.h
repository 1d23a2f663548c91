// A window as panes see it.
#pragma once
#include "frame/Provider.h"
#include "host/RGBColor.h"

class OSPort;

namespace TarnOSWindow {

class OSWindow;

// Hears that the platform's window behind a window object comes and goes. The object may outlive several of
// them.
class OSWindow_PlatformWindowListener : public Dependent<OSWindow_PlatformWindowListener> {
public:
    virtual void PlatformWindow_Opened(OSWindow &) {}  // it stands, and may be drawn on
    virtual void PlatformWindow_Closing(OSWindow &) {} // it is about to go
};

class OSWindow : public Provider<OSWindow_PlatformWindowListener> {
public:
    // Where a new window goes in the order of windows.
    enum PositionArg { PositionOnTop = 0 };
    class SendBehindArg { // a place in that order
    public:
        explicit SendBehindArg(PositionArg p)
            : position(p) {}

        PositionArg position; // where the window goes
    };

    virtual ~OSWindow() {}
    // The window's port, never null; stays the window's.
    virtual OSPort *GetPort() = 0;
    // Whether the window is shown; it may be covered by others all the same.
    virtual bool IsVisible() = 0;
    // The ground that the content is erased to.
    virtual RGBColor GetContentColor() = 0;
};

} // namespace TarnOSWindow
