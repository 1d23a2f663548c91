// The small drawings of menus and closed pop-ups.
#pragma once
#include "host/Geometry.h"

class MenuItemDecorator;

namespace MenuMarks {

enum State { kPlain = 0, kLit = 1, kDisabled = 2 };
// The first icon of each mark, in family 2007; those of the other states follow.
enum Mark { kCheck = 0, kSubmenu = 3, kScrollUp = 6, kScrollDown = 9, kPulldown = 12, kNarrowPulldown = 15 };
int const kArrowWidth = 12; // of the marks that scroll, in pixels

// Draws the mark with its left edge at the place, halfway between the rectangle's top and bottom.
void Draw(Mark, State, int left, Rect const &);
// Draws the icon of an item there: of family 2006, whose icons from 101 on show the ones from 1 on as they
// look on the highlight, where there are any. Disabled ones are faded.
void DrawItemIcon(short icon, State, int left, Rect const &);
// Lets the decorator draw, and puts the port back as it was.
void DrawDecorator(MenuItemDecorator &, Rect const &, bool lit, bool enabled);

} // namespace MenuMarks
