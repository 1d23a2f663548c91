#include "desktop/windows/SdlSession.h"
#include "desktop/windows/SdlComposeCache.h"
#include "desktop/windows/SdlScreen.h"
#include "desktop/windows/SdlTimeOfUse.h"
#include <SDL.h>
#include <SDL_syswm.h>
#include <cstring>
#include <stdexcept>
#include <string>
#include <unistd.h>

static char const *const kVideoDriver = "x11";

namespace {
struct Hint {
    char const *name, *value;
};
} // namespace

static Hint const kHints[] = {
    // The Wayland driver loses the places of pop-ups and the capture of the mouse; the X server of a Wayland
    // session has both.
    {SDL_HINT_VIDEODRIVER, kVideoDriver},
    // Pixels go to the window straight from memory: through a texture the first one takes half a second and
    // 90 MB.
    {SDL_HINT_FRAMEBUFFER_ACCELERATION, "0"},
    {SDL_HINT_VIDEO_X11_NET_WM_BYPASS_COMPOSITOR, "0"},
    {SDL_HINT_VIDEO_ALLOW_SCREENSAVER, "1"},
    // Long compositions of an input method arrive whole.
    {SDL_HINT_IME_SUPPORT_EXTENDED_TEXT, "1"},
    // A click that brings the window to the front works on the control under it too: mixers stand beside
    // other windows.
    {SDL_HINT_MOUSE_FOCUS_CLICKTHROUGH, "1"},
    // SDL would ask the server half a dozen questions at every press, even when the button has come up
    // already. The mouse is captured for those that last.
    {SDL_HINT_MOUSE_AUTO_CAPTURE, "0"},
    // The desktop decides when the program ends.
    {SDL_HINT_QUIT_ON_LAST_WINDOW_CLOSE, "0"},
    // SIGINT and SIGTERM end the program as the session's end does.
    {SDL_HINT_NO_SIGNAL_HANDLERS, "0"},
};

// Their numbers in the X protocol.
static unsigned char const kSendEventRequest = 25, kTranslateCoordinatesRequest = 40;

// SDL wakes its own wait by sending an event to a window, over a second connection to the server, and asks
// where the window manager's frame lies when it hears that the window in it has moved. When window or frame
// go at the same moment, the server refuses that, and Xlib's own handler would end the program.
//
// SDL has a handler too, which leaves full screens at any error and hands it on to the one that it found.
// When it closes its connections it has put that one back already. So there is one of ours on either side of
// it.
static XErrorHandler theHandlerBeforeSdl = nullptr, theHandlerOfSdl = nullptr;

static bool IsForAWindowThatIsGone(XErrorEvent const *error) {
    return error->error_code == BadWindow &&
           (error->request_code == kSendEventRequest || error->request_code == kTranslateCoordinatesRequest);
}

static int HandleBehindSdl(Display *display, XErrorEvent *error) {
    return IsForAWindowThatIsGone(error) ? 0 : theHandlerBeforeSdl(display, error);
}

static int HandleBeforeSdl(Display *display, XErrorEvent *error) {
    return IsForAWindowThatIsGone(error) ? 0 : theHandlerOfSdl(display, error);
}

static std::runtime_error NoDisplay(std::string const &reason) {
    return std::runtime_error("no display: " + reason);
}

SdlSession::SdlSession() {
    SdlComposeCache const cache(geteuid()); // SDL has Xlib read the table
    for (Hint const &hint : kHints)
        SDL_SetHintWithPriority(hint.name, hint.value, SDL_HINT_OVERRIDE);
    theHandlerBeforeSdl = XSetErrorHandler(HandleBehindSdl);
    if (SDL_InitSubSystem(SDL_INIT_VIDEO) != 0) {
        XSetErrorHandler(theHandlerBeforeSdl);
        throw NoDisplay(SDL_GetError());
    }
    // Without a display SDL may settle for a driver that shows nothing and polls for its events.
    char const *driver = SDL_GetCurrentVideoDriver();
    if (driver == nullptr || std::strcmp(driver, kVideoDriver) != 0) {
        SDL_QuitSubSystem(SDL_INIT_VIDEO);
        XSetErrorHandler(theHandlerBeforeSdl);
        throw NoDisplay("the X server cannot be reached");
    }
    theHandlerOfSdl = XSetErrorHandler(HandleBeforeSdl);
    // Text input is on at first, and an input method would take the keys of shortcuts.
    SDL_StopTextInput();
}

SdlSession::~SdlSession() {
    SdlTimeOfUse::Forget();
    SdlScreen::Forget();
    SDL_QuitSubSystem(SDL_INIT_VIDEO);
    XSetErrorHandler(theHandlerBeforeSdl);
}
