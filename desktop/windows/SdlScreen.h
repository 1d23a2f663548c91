// The X server that SDL's windows are on.
#pragma once

struct SDL_Window;

namespace SdlScreen {

// To be called for every window of SDL that is made; only the first one of a session has an effect. What
// would wake the program for nothing does not reach it any more: the mouse over other windows, for which SDL
// has asked the server, and that a move of pixels within a window has missed none. Those that it has missed
// are an exposure, as when other windows uncover them.
void LimitEvents(SDL_Window *);

// Where the mouse is, in device pixels. The server is asked: SDL keeps a place that those events would renew.
// (0, 0) while there has been no window.
void GetMousePlace(int &x, int &y);

// Whether there is a connection to wait for; not before the first window.
bool CanWait();
// Waits for the server to send something, or for a signal, no longer than so many milliseconds. Whether
// something came; may end early without. SDL, whose own wait looks for events first, does not learn of it.
bool Wait(int milliseconds);

// SDL has given up its connection to the server.
void Forget();

} // namespace SdlScreen
