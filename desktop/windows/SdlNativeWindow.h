// The window of the X server that a window of SDL is.
#pragma once
#include <X11/Xlib.h>

struct SDL_Window;

struct SdlNativeWindow {
    // None for null, and for one that lies on no X server.
    static SdlNativeWindow Of(SDL_Window *);

    Display *display = nullptr; // SDL's
    ::Window window = None;
};
