#include "tests/window/XScreen.h"
#include <X11/Xlib.h>
#include <X11/Xutil.h>
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

std::uint32_t XScreen::PixelAt(int x, int y) const {
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

int XScreen::ColourBits() const {
    Display *display = connection->display;
    return DefaultDepth(display, DefaultScreen(display)) >= kDeepColourDepth ? kFullBits : kReducedBits;
}
