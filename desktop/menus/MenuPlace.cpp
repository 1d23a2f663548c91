#include "desktop/menus/MenuPlace.h"
#include <algorithm>

MenuPlace MenuPlace::Over(ScreenRect const &popup, ScreenRect const &screen, MenuRows const &rows, int width,
                          int indent, int current) {
    bool const exists = current >= 1 && current <= rows.Count();
    int const middle = rows.Count() == 0 ? rows.Height() / 2 : rows.Middle(exists ? current : 1);
    int const height = std::min(rows.Height(), std::max(screen.Height(), 1));
    int const left = popup.left - indent;
    int const top = (popup.top + popup.bottom) / 2 - middle; // of the whole menu
    ScreenRect const whole{left, top, left + width, top + rows.Height()};
    MenuPlace place;
    if (height == rows.Height()) {
        place.box = whole.Within(screen);
        return place;
    }
    place.box = ScreenRect{left, screen.top, left + width, screen.top + height}.Within(screen);
    place.scroll = std::clamp(screen.top - top, 0, rows.Height() - height);
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
