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

void SdlCapture::IgnoreEntering() {
    for (SdlWindow *window : windows) {
        if (eventMasks.count(window->Raw()) != 0)
            continue;
        XWindow const xWindow(window->Raw());
        long mask = xWindow.EventMask();
        if (mask == 0)
            continue;
        xWindow.Select(mask & ~EnterWindowMask);
        eventMasks[window->Raw()] = mask;
    }
    if (!windows.empty())
        XWindow(windows.front()->Raw()).Synchronize();
}

void SdlCapture::Hold(bool withoutButton) {
    IgnoreEntering();
    SDL_PumpEvents(); // an entering that has come before ends the grab now, not afterwards
    SDL_CaptureMouse(SDL_FALSE);
    SDL_SetHintWithPriority(SDL_HINT_MOUSE_AUTO_CAPTURE, "0", SDL_HINT_OVERRIDE);
    SDL_SetHintWithPriority(SDL_HINT_MOUSE_AUTO_CAPTURE, "1", SDL_HINT_OVERRIDE);
    if (withoutButton)
        SDL_CaptureMouse(SDL_TRUE);
}

void SdlCapture::Forget(SdlWindow const *window) { eventMasks.erase(window->Raw()); }

void SdlCapture::End() {
    SDL_CaptureMouse(SDL_FALSE);
    for (SdlWindow *window : windows) {
        auto found = eventMasks.find(window->Raw());
        if (found != eventMasks.end())
            XWindow(window->Raw()).Select(found->second);
    }
    eventMasks.clear();
}
