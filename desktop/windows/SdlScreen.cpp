#include "desktop/windows/SdlScreen.h"
#include "desktop/windows/SdlEventFilter.h"
#include "desktop/windows/SdlNativeWindow.h"
#include <X11/extensions/XInput2.h>
#include <poll.h>

static Display *theDisplay = nullptr; // SDL's
static unsigned long theFlushed = 0;  // number of the request that was to come next when all were sent

// SDL itself would not take it for one.
static bool MakeExposure(XEvent &event) {
    XGraphicsExposeEvent const missing = event.xgraphicsexpose;
    event.xexpose = {Expose,    missing.serial, missing.send_event, missing.display, missing.drawable,
                     missing.x, missing.y,      missing.width,      missing.height,  missing.count};
    return true;
}

static bool Drop(XEvent &) { return false; }

void SdlScreen::LimitEvents(SDL_Window *window) {
    if (theDisplay != nullptr)
        return;
    theDisplay = SdlNativeWindow::Of(window).display;
    if (theDisplay == nullptr)
        return;
    SdlEventFilter::Set(theDisplay, GraphicsExpose, MakeExposure);
    SdlEventFilter::Set(theDisplay, NoExpose, Drop);
    // Every movement and press of the mouse on the whole screen.
    int opcode = 0, event = 0, error = 0;
    if (!XQueryExtension(theDisplay, "XInputExtension", &opcode, &event, &error))
        return; // then SDL has not asked either
    unsigned char nothing[XIMaskLen(XI_LASTEVENT)] = {};
    XIEventMask mask = {XIAllMasterDevices, sizeof(nothing), nothing};
    XISelectEvents(theDisplay, DefaultRootWindow(theDisplay), &mask, 1);
}

void SdlScreen::GetMousePlace(int &x, int &y) {
    x = y = 0;
    if (theDisplay == nullptr)
        return;
    Window root = 0, child = 0;
    int windowX = 0, windowY = 0;
    unsigned int modifiers = 0;
    XQueryPointer(theDisplay, DefaultRootWindow(theDisplay), &root, &child, &x, &y, &windowX, &windowY,
                  &modifiers);
}

bool SdlScreen::CanWait() { return theDisplay != nullptr; }

// Where nothing has been asked of the server since the last time, nothing waits to be sent, and what had come
// until then has been taken.
bool SdlScreen::Wait(int milliseconds) {
    if (unsigned long const next = NextRequest(theDisplay); next != theFlushed) {
        XFlush(theDisplay);
        theFlushed = next;
        if (XEventsQueued(theDisplay, QueuedAlready) > 0)
            return true;
    }
    pollfd connection = {ConnectionNumber(theDisplay), POLLIN, 0};
    int const came = poll(&connection, 1, milliseconds);
    return came > 0 ? XEventsQueued(theDisplay, QueuedAfterReading) > 0 : came < 0; // a signal counts
}

void SdlScreen::Forget() {
    theDisplay = nullptr;
    theFlushed = 0;
}
