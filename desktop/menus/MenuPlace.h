// Where on the screen a menu opens.
#pragma once
#include "desktop/menus/MenuRows.h"
#include "desktop/menus/ScreenRect.h"

// A menu's place, and how far it is scrolled there.
struct MenuPlace {
    ScreenRect box;
    int scroll = 0; // pixels of the menu above the upper edge

    // The menu of the given width over the place of a closed pop-up, so that the middle of the current item
    // (0: the first) lies on the middle of that. Where the screen is too small for it to stay there the menu
    // moves, and when it is higher than the screen it scrolls. `indent`: from the menu's left edge to that of
    // the pop-up.
    static MenuPlace Over(ScreenRect const &popup, ScreenRect const &screen, MenuRows const &, int width,
                          int indent, int current);
    // A submenu beside its item: to the right of the menu, or where there is no room on its left. Its first
    // item is level with the one that opens it. It overlaps the menu by the given pixels.
    static MenuPlace Beside(ScreenRect const &menu, int itemTop, ScreenRect const &screen, MenuRows const &,
                            int width, int overlap);
};
