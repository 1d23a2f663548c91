#include "desktop/windows/SdlCapture.h"
#include "desktop/windows/SdlNativeWindow.h"
#include "desktop/windows/SdlWindow.h"
#include <SDL.h>

// What the server tells the program of the window; 0 when there is no knowing.
static long AskEventMask(SDL_Window *window) {
    SdlNativeWindow const native = SdlNativeWindow::Of(window);
    XWindowAttributes attributes;
    bool const told =
        native.window != None && XGetWindowAttributes(native.display, native.window, &attributes) != 0;
    return told ? attributes.your_event_mask : 0;
}

static void Select(SDL_Window *window, long eventMask) {
    SdlNativeWindow const native = SdlNativeWindow::Of(window);
    if (native.window != None)
        XSelectInput(native.display, native.window, eventMask);
}

SdlCapture::SdlCapture(std::vector<SdlWindow *> const &windows_)
    : windows(windows_) {}

// Asked once for each window: the server takes two questions for it, at every press.
long SdlCapture::EventMaskOf(SDL_Window *window) {
    long &mask = eventMasks[window];
    if (mask == 0)
        mask = AskEventMask(window);
    return mask;
}

void SdlCapture::IgnoreEntering() {
    for (SdlWindow *window : windows) {
        long mask = EventMaskOf(window->Raw());
        if (mask == 0 || !ignoring.insert(window->Raw()).second)
            continue;
        Select(window->Raw(), mask & ~EnterWindowMask);
    }
    Display *const display = windows.empty() ? nullptr : SdlNativeWindow::Of(windows.front()->Raw()).display;
    if (display != nullptr)
        XSync(display, False); // all is done then, and the events of it wait to be taken
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
        Select(window, eventMasks[window]);
    ignoring.clear();
}
