#include "tests/window/XScreen.h"
#include <SDL.h>
#include <SDL_syswm.h>
#include <X11/Xlib.h>
#include <X11/Xutil.h>
#include <X11/extensions/Xfixes.h>
#include <stdexcept>

static int const kDeepColourDepth = 24;
static int const kFullBits = 8, kReducedBits = 5;

struct XScreen::Connection {
    Connection()
        : display(XOpenDisplay(nullptr)) {
        if (display == nullptr)
            throw std::runtime_error("the X server does not answer");
    }
    ~Connection() { XCloseDisplay(display); }
    Display *display;
};

XScreen::XScreen()
    : connection(new Connection) {}

XScreen::~XScreen() {}

// The server may take requests of two clients in any order.
static void FinishRequestsOfSdl() {
    Uint32 const kMostWindows = 1000; // of one process of tests
    SDL_SysWMinfo info;
    SDL_VERSION(&info.version);
    for (Uint32 id = 1; SDL_WasInit(SDL_INIT_VIDEO) != 0 && id < kMostWindows; ++id)
        if (SDL_Window *const window = SDL_GetWindowFromID(id); SDL_GetWindowWMInfo(window, &info)) {
            XSync(info.info.x11.display, False);
            return;
        }
}

std::uint32_t XScreen::PixelAt(int x, int y) const {
    FinishRequestsOfSdl();
    Display *display = connection->display;
    XImage *image = XGetImage(display, DefaultRootWindow(display), x, y, 1, 1, AllPlanes, ZPixmap);
    if (image == nullptr)
        throw std::runtime_error("the X server gives no picture of its screen");
    XColor colour = {};
    colour.pixel = XGetPixel(image, 0, 0);
    XDestroyImage(image);
    XQueryColor(display, DefaultColormap(display, DefaultScreen(display)), &colour);
    return (static_cast<std::uint32_t>(colour.red >> 8) << 16) |
           (static_cast<std::uint32_t>(colour.green >> 8) << 8) | (colour.blue >> 8);
}

void XScreen::SendToAWindowThatIsGone() const {
    Display *display = connection->display;
    Window window = XCreateSimpleWindow(display, DefaultRootWindow(display), 0, 0, 1, 1, 0, 0, 0);
    XDestroyWindow(display, window);
    XEvent event = {};
    event.xclient.type = ClientMessage;
    event.xclient.window = window;
    event.xclient.format = 32;
    XSendEvent(display, window, False, NoEventMask, &event);
    XSync(display, False);
}

int XScreen::ColourBits() const {
    Display *display = connection->display;
    return DefaultDepth(display, DefaultScreen(display)) >= kDeepColourDepth ? kFullBits : kReducedBits;
}

XScreen::PointerPicture XScreen::Pointer() const {
    // The library answers nothing to a client that has not asked for the extension.
    int events, errors;
    XFixesCursorImage *image = XFixesQueryExtension(connection->display, &events, &errors)
                                   ? XFixesGetCursorImage(connection->display)
                                   : nullptr;
    if (image == nullptr)
        throw std::runtime_error("the X server does not show its pointer");
    int middle = image->height / 2 * image->width + image->width / 2;
    PointerPicture picture = {image->width, image->height, image->xhot, image->yhot,
                              static_cast<std::uint32_t>(image->pixels[middle])};
    XFree(image);
    return picture;
}
