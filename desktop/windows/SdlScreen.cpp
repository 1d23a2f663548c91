#include "desktop/windows/SdlScreen.h"
#include <SDL.h>
#include <SDL_syswm.h>
#include <X11/extensions/XInput2.h>
#include <algorithm>
#include <poll.h>
#include <vector>

static Display *theDisplay = nullptr; // SDL's
static Atom theTimeOfUse = None;
static unsigned long theFlushed = 0; // number of the request that was to come next when all were sent

void SdlScreen::IgnoreOtherWindowsMouse(SDL_Window *window) {
    SDL_SysWMinfo info;
    SDL_VERSION(&info.version);
    if (theDisplay != nullptr || window == nullptr || SDL_GetWindowWMInfo(window, &info) != SDL_TRUE)
        return;
    theDisplay = info.info.x11.display;
    theTimeOfUse = XInternAtom(theDisplay, "_NET_WM_USER_TIME", False); // known here since SDL asked
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

// With each press and key SDL notes at the window when it was used last, for window managers, and the server
// says so. Nobody wants to know: whether that was all that came.
static bool TakeNoteOfUse() {
    if (XEventsQueued(theDisplay, QueuedAfterReading) != 1)
        return false;
    XEvent event;
    XPeekEvent(theDisplay, &event);
    if (event.type != PropertyNotify || event.xproperty.atom != theTimeOfUse)
        return false;
    XNextEvent(theDisplay, &event);
    return true;
}

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
    return came != 0 && !(came > 0 && TakeNoteOfUse()); // an interruption by a signal counts
}

namespace {
struct Watched {
    ::Window window;
    Uint32 id; // SDL's
};
} // namespace

static std::vector<Watched> theWatched;

// Called by SDL for every event before it is queued, and for every message of the server while it hands those
// on: they end here, one of missing pixels as the exposure that SDL would not make of it.
static int SDLCALL TakeMissing(void *, SDL_Event *event) {
    if (event->type != SDL_SYSWMEVENT)
        return 1;
    XEvent const &message = event->syswm.msg->msg.x11.event;
    if (message.type != GraphicsExpose)
        return 0;
    auto const found = std::find_if(theWatched.begin(), theWatched.end(), [&](Watched const &watched) {
        return watched.window == message.xgraphicsexpose.drawable;
    });
    if (found == theWatched.end())
        return 0;
    SDL_WindowEvent exposure = {};
    exposure.type = SDL_WINDOWEVENT;
    exposure.windowID = found->id;
    exposure.event = SDL_WINDOWEVENT_EXPOSED;
    event->window = exposure;
    return 1;
}

void SdlScreen::WatchMoves(SDL_Window *window) {
    SDL_SysWMinfo info;
    SDL_VERSION(&info.version);
    if (SDL_GetWindowWMInfo(window, &info) != SDL_TRUE || info.subsystem != SDL_SYSWM_X11)
        return;
    if (theWatched.empty()) {
        SDL_SetEventFilter(TakeMissing, nullptr);
        SDL_EventState(SDL_SYSWMEVENT, SDL_ENABLE);
    }
    ::Window const watched = info.info.x11.window; // the server gives numbers anew
    theWatched.erase(std::remove_if(theWatched.begin(), theWatched.end(),
                                    [&](Watched const &other) { return other.window == watched; }),
                     theWatched.end());
    theWatched.push_back({watched, SDL_GetWindowID(window)});
}

void SdlScreen::Forget() {
    theDisplay = nullptr;
    theFlushed = 0;
    theWatched.clear();
}
