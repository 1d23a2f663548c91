// The X server that SDL's windows are on.
#pragma once

struct SDL_Window;

namespace SdlScreen {

// To be called for every window of SDL that is made; only the first one of a session has an effect. SDL asks
// the server for every movement and press of the mouse on the whole screen, and so wakes the program whenever
// the mouse moves anywhere: the server is told that these are not wanted. What concerns the windows comes as
// before.
void IgnoreOtherWindowsMouse(SDL_Window *);

// Where the mouse is, in device pixels. The server is asked: SDL keeps a place that those events would renew.
// (0, 0) while there has been no window.
void GetMousePlace(int &x, int &y);

// Whether there is a connection to wait for; not before the first window.
bool CanWait();
// Waits for the server to send something, or for a signal, no longer than so many milliseconds. Whether
// something came; may end early without. SDL, whose own wait looks for events first, does not learn of it.
bool Wait(int milliseconds);

// From now on SDL reports the window as exposed, as it does for what other windows uncover, when pixels are
// moved within it and some of them were not on the screen.
void WatchMoves(SDL_Window *);

// SDL has given up its connection to the server.
void Forget();

} // namespace SdlScreen
