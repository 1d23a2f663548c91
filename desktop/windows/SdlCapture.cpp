#include "desktop/windows/SdlCapture.h"
#include "desktop/windows/SdlWindow.h"
#include <SDL.h>
#include <SDL_syswm.h>

namespace {

// A window of SDL as the X library knows it.
class XWindow {
public:
    explicit XWindow(SDL_Window *window)
        : info() {
        SDL_VERSION(&info.version);
        known = SDL_GetWindowWMInfo(window, &info) == SDL_TRUE;
    }
    long EventMask() const {
        XWindowAttributes attributes;
        bool told =
            known && XGetWindowAttributes(info.info.x11.display, info.info.x11.window, &attributes) != 0;
        return told ? attributes.your_event_mask : 0;
    }
    void Select(long eventMask) const {
        if (known)
            XSelectInput(info.info.x11.display, info.info.x11.window, eventMask);
    }
    // Returns once the server has done everything that it was asked for; the events of it wait to be taken.
    void Synchronize() const {
        if (known)
            XSync(info.info.x11.display, False);
    }

private:
    SDL_SysWMinfo info;
    bool known;
};

} // namespace

SdlCapture::SdlCapture(std::vector<SdlWindow *> const &windows_)
    : windows(windows_) {}

// Asked once for each window: the server takes two questions for it, at every press.
long SdlCapture::EventMaskOf(SDL_Window *window) {
    long &mask = eventMasks[window];
    if (mask == 0)
        mask = XWindow(window).EventMask();
    return mask;
}

void SdlCapture::IgnoreEntering() {
    for (SdlWindow *window : windows) {
        long mask = EventMaskOf(window->Raw());
        if (mask == 0 || !ignoring.insert(window->Raw()).second)
            continue;
        XWindow(window->Raw()).Select(mask & ~EnterWindowMask);
    }
    if (!windows.empty())
        XWindow(windows.front()->Raw()).Synchronize();
}

void SdlCapture::Hold() {
    holds = true;
    IgnoreEntering();
    SDL_PumpEvents(); // an entering that has come before ends the grab now, not afterwards
    SDL_CaptureMouse(SDL_FALSE);
    SDL_CaptureMouse(SDL_TRUE);
}

void SdlCapture::Forget(SdlWindow const *window) {
    ignoring.erase(window->Raw());
    eventMasks.erase(window->Raw());
}

// SDL asks the server nothing when it does not have the capture.
void SdlCapture::End() {
    holds = false;
    SDL_CaptureMouse(SDL_FALSE);
    for (SDL_Window *window : ignoring)
        XWindow(window).Select(eventMasks[window]);
    ignoring.clear();
}
