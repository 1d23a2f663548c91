#include "tests/window/XScreen.h"
#include <SDL.h>
#include <SDL_syswm.h>
#include <X11/Xatom.h>
#include <X11/Xlib.h>
#include <X11/Xutil.h>
#include <X11/extensions/Xfixes.h>
#include <map>
#include <stdexcept>

static int const kDeepColourDepth = 24;
static int const kAtomBits = 32; // as sent
static int const kFullBits = 8, kReducedBits = 5;

struct XScreen::Connection {
    Connection()
        : display(XOpenDisplay(nullptr)) {
        if (display == nullptr)
            throw std::runtime_error("the X server does not answer");
    }
    ~Connection() { XCloseDisplay(display); }

    Window WindowThatIsGone() const {
        Window const window = XCreateSimpleWindow(display, DefaultRootWindow(display), 0, 0, 1, 1, 0, 0, 0);
        XDestroyWindow(display, window);
        return window;
    }
    Atom Supported() const { return XInternAtom(display, "_NET_SUPPORTED", False); }
    // As 0xRRGGBB.
    std::uint32_t ColourOf(unsigned long pixel) const {
        XColor colour = {};
        colour.pixel = pixel;
        XQueryColor(display, DefaultColormap(display, DefaultScreen(display)), &colour);
        return (static_cast<std::uint32_t>(colour.red >> 8) << 16) |
               (static_cast<std::uint32_t>(colour.green >> 8) << 8) | (colour.blue >> 8);
    }

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

std::uint32_t XScreen::PixelAt(int x, int y) const { return PixelsIn(x, y, 1, 1).front(); }

std::vector<std::uint32_t> XScreen::PixelsIn(int x, int y, int width, int height) const {
    FinishRequestsOfSdl();
    Display *display = connection->display;
    XImage *image = XGetImage(display, DefaultRootWindow(display), x, y, static_cast<unsigned>(width),
                              static_cast<unsigned>(height), AllPlanes, ZPixmap);
    if (image == nullptr)
        throw std::runtime_error("the X server gives no picture of its screen");
    std::vector<std::uint32_t> pixels;
    pixels.reserve(static_cast<std::size_t>(width) * static_cast<std::size_t>(height));
    // Asking for a colour takes time, and neighbours are mostly of one.
    std::map<unsigned long, std::uint32_t> colours;
    auto latest = colours.end();
    for (int row = 0; row < height; ++row) {
        for (int column = 0; column < width; ++column) {
            unsigned long const value = XGetPixel(image, column, row);
            if (latest == colours.end() || latest->first != value)
                latest = colours.find(value);
            if (latest == colours.end())
                latest = colours.emplace(value, connection->ColourOf(value)).first;
            pixels.push_back(latest->second);
        }
    }
    XDestroyImage(image);
    return pixels;
}

void XScreen::PointAt(int x, int y) const {
    Display *display = connection->display;
    XWarpPointer(display, None, DefaultRootWindow(display), 0, 0, 0, 0, x, y);
    XSync(display, False);
}

std::vector<std::string> XScreen::SaidByManager() const {
    long const most = 1000;
    Display *const display = connection->display;
    Atom type = None;
    int bits = 0;
    unsigned long count = 0, rest = 0;
    unsigned char *data = nullptr;
    XGetWindowProperty(display, DefaultRootWindow(display), connection->Supported(), 0, most, False, XA_ATOM,
                       &type, &bits, &count, &rest, &data);
    std::vector<std::string> names;
    for (unsigned long i = 0; i < count; ++i) {
        char *const name = XGetAtomName(display, reinterpret_cast<Atom *>(data)[i]);
        names.push_back(name);
        XFree(name);
    }
    XFree(data);
    return names;
}

void XScreen::LetManagerSay(std::vector<std::string> const &names) const {
    Display *const display = connection->display;
    std::vector<Atom> atoms;
    for (std::string const &name : names)
        atoms.push_back(XInternAtom(display, name.c_str(), False));
    XChangeProperty(display, DefaultRootWindow(display), connection->Supported(), XA_ATOM, kAtomBits,
                    PropModeReplace, reinterpret_cast<unsigned char *>(atoms.data()),
                    static_cast<int>(atoms.size()));
    XSync(display, False);
}

void XScreen::LookForAWindowThatIsGone() const {
    int x, y;
    Window child;
    Display *display = connection->display;
    XTranslateCoordinates(display, connection->WindowThatIsGone(), DefaultRootWindow(display), 0, 0, &x, &y,
                          &child);
}

void XScreen::SendToAWindowThatIsGone() const {
    Display *display = connection->display;
    Window window = connection->WindowThatIsGone();
    XEvent event = {};
    event.xclient.type = ClientMessage;
    event.xclient.window = window;
    event.xclient.format = 32;
    XSendEvent(display, window, False, NoEventMask, &event);
    XSync(display, False);
}

unsigned long XScreen::ClipboardOwner() const {
    return XGetSelectionOwner(connection->display, XInternAtom(connection->display, "CLIPBOARD", False));
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
