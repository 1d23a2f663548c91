// The pictures of the mouse pointer.
#pragma once
#include "desktop/drawing/DeviceScale.h"
#include <map>
#include <string>
#include <utility>

struct SDL_Cursor;

// The system's own pointers for those of Cursors, so that they are those of all programs, and pictures of the
// artwork for the resource numbers.
class SdlCursors {
public:
    SdlCursors() = default;
    ~SdlCursors();
    SdlCursors(SdlCursors const &) = delete;
    SdlCursors &operator=(SdlCursors const &) = delete;

    // Sets the pointer of all windows, in the present theme; the arrow for a number without picture. Throws
    // ResourceError when the table of cursors is broken.
    void Show(int number, DeviceScale);

private:
    SDL_Cursor *Demand(int number, DeviceScale);
    void FollowResources();
    void FreeAll();

    std::map<std::pair<int, int>, SDL_Cursor *> cursors; // by number and scale in thousandths; to be freed
    SDL_Cursor *shown = nullptr;
    unsigned int generation = 0; // of Resources, when the pictures were made
    std::string theme;
};
