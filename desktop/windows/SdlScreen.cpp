#include "desktop/windows/SdlScreen.h"
#include <SDL.h>
#include <SDL_syswm.h>
#include <X11/extensions/XInput2.h>
#include <poll.h>

static Display *theDisplay = nullptr; // SDL's

void SdlScreen::IgnoreOtherWindowsMouse(SDL_Window *window) {
    SDL_SysWMinfo info;
    SDL_VERSION(&info.version);
    if (theDisplay != nullptr || window == nullptr || SDL_GetWindowWMInfo(window, &info) != SDL_TRUE)
        return;
    theDisplay = info.info.x11.display;
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

bool SdlScreen::Wait(int milliseconds) {
    XFlush(theDisplay);
    if (XEventsQueued(theDisplay, QueuedAlready) > 0)
        return true;
    pollfd connection = {ConnectionNumber(theDisplay), POLLIN, 0};
    return poll(&connection, 1, milliseconds) != 0; // an interruption by a signal counts
}

void SdlScreen::Forget() { theDisplay = nullptr; }
