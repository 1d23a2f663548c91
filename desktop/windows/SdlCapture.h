// SDL's capture of the mouse, made to last.
#pragma once
#include <map>
#include <set>
#include <vector>

struct SDL_Window;
class SdlWindow;

// SDL captures the mouse while it is told to. But it ends the X server's grab again whenever the pointer
// enters one of its windows and whenever one becomes active, and believes that it still has it. The grab
// itself makes the pointer enter the window, when it was outside. So the windows are told of no entering
// while the capture is wanted, and it is taken anew after an activation.
class SdlCapture {
public:
    // The windows that there are, at any time.
    explicit SdlCapture(std::vector<SdlWindow *> const &);

    // Takes the capture, or takes it anew, until End. SDL refuses while no window is active.
    void Hold();
    bool Holds() const { return holds; }
    void End();
    void Forget(SdlWindow const *); // about to be destroyed

private:
    void IgnoreEntering();
    long EventMaskOf(SDL_Window *);

    std::vector<SdlWindow *> const &windows;
    bool holds = false;
    std::set<SDL_Window *> ignoring;         // the windows that are told of no entering
    std::map<SDL_Window *, long> eventMasks; // as SDL has made the windows; it leaves them at that
};
