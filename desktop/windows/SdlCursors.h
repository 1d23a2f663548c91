// The pictures of the mouse pointer.
#pragma once
#include <map>

struct SDL_Cursor;

// Shows the system's own pointers for those of Cursors, and pictures of the artwork for the resource numbers.
class SdlCursors {
public:
    SdlCursors() = default;
    ~SdlCursors();
    SdlCursors(SdlCursors const &) = delete;
    SdlCursors &operator=(SdlCursors const &) = delete;

    // Sets the pointer in all windows; the arrow for a number without picture. `scale` is that of the window under it.
    void Show(int number, double scale);
    // Pictures are made anew when next shown: the theme or the scale has changed.
    void Forget();

private:
    SDL_Cursor *Find(int number, double scale);

    std::map<int, SDL_Cursor *> cursors; // by number; all made by SDL, ours to free
    int shown = -1;
};
