#include "desktop/menus/MenuPlace.h"
#include <algorithm>

// Of a menu that scrolls.
static int const kLeastHeight = 12 * MenuRows::kItemHeight;

MenuPlace MenuPlace::Over(ScreenRect const &popup, ScreenRect const &screen, MenuRows const &rows, int width,
                          int indent, int current) {
    bool const exists = current >= 1 && current <= rows.Count();
    int const middle = rows.Count() == 0 ? rows.Height() / 2 : rows.Middle(exists ? current : 1);
    int const left = popup.left - indent;
    int const top = (popup.top + popup.bottom) / 2 - middle;
    ScreenRect const whole{left, top, left + width, top + rows.Height()};
    MenuPlace place;
    if (rows.Height() <= screen.Height()) {
        place.box = whole.Within(screen);
        return place;
    }
    // As much of it as the screen has room for; near the screen's edges at least a few items.
    place.box = {left, std::max(top, screen.top), left + width, std::min(whole.bottom, screen.bottom)};
    int const least = std::max(std::min(kLeastHeight, screen.Height()), 1);
    if (place.box.Height() < least) {
        place.box.top = std::clamp(place.box.top, screen.top, std::max(screen.bottom - least, screen.top));
        place.box.bottom = place.box.top + least;
    }
    place.box = place.box.Within(screen);
    place.scroll = std::clamp(place.box.top - top, 0, rows.Height() - place.box.Height());
    return place;
}

MenuPlace MenuPlace::Beside(ScreenRect const &menu, int itemTop, ScreenRect const &screen,
                            MenuRows const &rows, int width, int overlap) {
    int const height = std::min(rows.Height(), std::max(screen.Height(), 1));
    bool const right =
        menu.right - overlap + width <= screen.right || screen.right - menu.right >= menu.left - screen.left;
    int const left = right ? menu.right - overlap : menu.left + overlap - width;
    int const top = itemTop - MenuRows::kPad;
    MenuPlace place;
    place.box = ScreenRect{left, top, left + width, top + height}.Within(screen);
    return place;
}
