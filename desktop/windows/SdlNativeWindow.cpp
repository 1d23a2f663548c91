#include "desktop/windows/SdlNativeWindow.h"
#include <SDL.h>
#include <SDL_syswm.h>

SdlNativeWindow SdlNativeWindow::Of(SDL_Window *window) {
    SDL_SysWMinfo info;
    SDL_VERSION(&info.version);
    if (window == nullptr || SDL_GetWindowWMInfo(window, &info) != SDL_TRUE ||
        info.subsystem != SDL_SYSWM_X11)
        return SdlNativeWindow();
    SdlNativeWindow native;
    native.display = info.info.x11.display;
    native.window = info.info.x11.window;
    return native;
}
