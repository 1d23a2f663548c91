#include "desktop/windows/SdlTimeOfUse.h"
#include "desktop/windows/SdlEventFilter.h"
#include "desktop/windows/SdlNativeWindow.h"
#include <X11/Xatom.h>
#include <algorithm>
#include <memory>
#include <vector>

static int const kPropertyBits = 32; // as sent; in memory such numbers are longs
static long const kMostSupported = 4096;
static unsigned int const kLastButton = 3; // those above turn a wheel, or are reported to nobody

namespace {

enum AtomName { kSupported, kTime, kTimeWindow, kAtomNames };

struct Followed {
    ::Window window, noteWindow;
    Time latest;
    bool noted;
};

} // namespace

static char const *const kNames[kAtomNames] = {"_NET_SUPPORTED", "_NET_WM_USER_TIME",
                                               "_NET_WM_USER_TIME_WINDOW"};
static Display *theDisplay = nullptr; // SDL's
static Atom theAtoms[kAtomNames] = {};
static std::vector<Followed> theFollowed;
static bool theyAreNoted = true;

static bool Take(::Window window, Time time) {
    for (Followed &followed : theFollowed)
        if (followed.window == window) {
            followed.latest = time;
            followed.noted = theyAreNoted = false;
            return true;
        }
    return false;
}

// SDL notes no press that has no time.
static bool TakeTimeOfPress(XEvent &press) {
    if (press.xbutton.button <= kLastButton && Take(press.xbutton.window, press.xbutton.time))
        press.xbutton.time = CurrentTime;
    return true;
}

// Input methods want to know the time of a key too, so SDL notes it as well, where nobody reads it.
static bool CopyTimeOfKey(XEvent &key) {
    Take(key.xkey.window, key.xkey.time);
    return true;
}

// That SDL has noted a time is news to nobody here.
static bool IsNoNoteOfUse(XEvent &change) { return change.xproperty.atom != theAtoms[kTime]; }

// Reads nothing where no window manager says what it knows: then nobody wants the times.
static bool ManagerReadsOnlyAtWindows() {
    Atom type = None;
    int bits = 0;
    unsigned long count = 0, rest = 0;
    unsigned char *data = nullptr;
    XGetWindowProperty(theDisplay, DefaultRootWindow(theDisplay), theAtoms[kSupported], 0, kMostSupported,
                       False, XA_ATOM, &type, &bits, &count, &rest, &data);
    std::unique_ptr<unsigned char, int (*)(void *)> const owned(data, XFree);
    if (type != XA_ATOM || bits != kPropertyBits)
        return false;
    Atom const *const known = reinterpret_cast<Atom const *>(data), *const end = known + count;
    return std::find(known, end, theAtoms[kTime]) != end &&
           std::find(known, end, theAtoms[kTimeWindow]) == end;
}

static void Connect(Display *display) {
    theDisplay = display;
    XInternAtoms(display, const_cast<char **>(kNames), kAtomNames, False, theAtoms);
    SdlEventFilter::Set(display, ButtonPress, TakeTimeOfPress);
    SdlEventFilter::Set(display, KeyPress, CopyTimeOfKey);
    SdlEventFilter::Set(display, PropertyNotify, IsNoNoteOfUse);
}

void SdlTimeOfUse::Follow(SDL_Window *made) {
    SdlNativeWindow const native = SdlNativeWindow::Of(made);
    if (native.window == None)
        return;
    if (theDisplay == nullptr)
        Connect(native.display);
    if (ManagerReadsOnlyAtWindows())
        return;
    ::Window const noteWindow =
        XCreateWindow(theDisplay, native.window, -1, -1, 1, 1, 0, 0, InputOnly, CopyFromParent, 0, nullptr);
    XChangeProperty(theDisplay, native.window, theAtoms[kTimeWindow], XA_WINDOW, kPropertyBits,
                    PropModeReplace, reinterpret_cast<unsigned char const *>(&noteWindow), 1);
    theFollowed.push_back({native.window, noteWindow, CurrentTime, true});
}

void SdlTimeOfUse::Leave(SDL_Window *window) {
    ::Window const left = SdlNativeWindow::Of(window).window;
    theFollowed.erase(std::remove_if(theFollowed.begin(), theFollowed.end(),
                                     [&](Followed const &followed) { return followed.window == left; }),
                      theFollowed.end());
}

void SdlTimeOfUse::Note() {
    if (theyAreNoted)
        return;
    theyAreNoted = true;
    for (Followed &followed : theFollowed) {
        if (followed.noted)
            continue;
        followed.noted = true;
        XChangeProperty(theDisplay, followed.noteWindow, theAtoms[kTime], XA_CARDINAL, kPropertyBits,
                        PropModeReplace, reinterpret_cast<unsigned char const *>(&followed.latest), 1);
    }
}

void SdlTimeOfUse::Forget() {
    theDisplay = nullptr;
    theFollowed.clear();
    theyAreNoted = true;
}
