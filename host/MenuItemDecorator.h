// A small drawing of an application's own before the text of a menu item.
#pragma once
#include "host/Geometry.h"

// Panes hand decorators on and never look inside; the menu that shows the item draws it.
class MenuItemDecorator {
public:
    virtual ~MenuItemDecorator() {}

    // Pixels that the drawing takes before the text; what is below 0 or above 200 is cut. The texts of all
    // items of a menu begin behind its widest decorator.
    virtual short GetWidth() const = 0;
    // Draws on the current port, whose colours are black on white, within the rectangle: as wide as asked for
    // and as high as the item. The item may be the one under the mouse, and it may be disabled.
    virtual void Draw(Rect const &, bool highlighted, bool enabled) = 0;
};
