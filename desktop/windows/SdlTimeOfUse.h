// When a window was used last. Window managers want to know, so that what opens by itself does not take the
// keyboard from somebody at work.
//
// SDL notes it at the window itself (_NET_WM_USER_TIME), in a write of its own: a press would wake the server
// before anything is drawn, and the server's word of the change would wake the program afterwards. So each
// window has another one for the times (_NET_WM_USER_TIME_WINDOW), which never shows and of which the server
// says nothing, and the time of a press goes out with what the press has drawn.
#pragma once

struct SDL_Window;

namespace SdlTimeOfUse {

// To be called for every window of SDL that is made. Where the window manager reads times, but only at the
// windows themselves, SDL goes on to note them.
void Follow(SDL_Window *);
// To be called before SDL destroys the window.
void Leave(SDL_Window *);
// Notes the times of the presses and keys that SDL has handed on; they go to the server with the next thing
// that is sent. To be called before the first of these is handled.
void Note();
// SDL is about to give up its connection to the server.
void Forget();

} // namespace SdlTimeOfUse
