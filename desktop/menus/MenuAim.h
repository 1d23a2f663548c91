// Whether the mouse is on its way to a submenu.
#pragma once
#include "desktop/menus/ScreenRect.h"
#include <deque>

// On its way from an item to the submenu beside it the mouse may cross other items. It is aiming at the
// submenu while it stays within the triangle from where it was a little before to the submenu's nearer
// corners.
class MenuAim {
public:
    void Forget() { trail.clear(); }
    // The mouse has come to the place; whether it is aiming at the submenu.
    bool Follow(ScreenPoint, ScreenRect const &submenu);

private:
    static constexpr std::size_t kTrail = 4; // how many places back the triangle begins
    std::deque<ScreenPoint> trail;
};
