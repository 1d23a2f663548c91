// What stands beside each other in the items of a menu.
#pragma once
#include "desktop/menus/MenuRows.h"

// Pixels from the menu's left edge, the same for all items: mark, icon, decorator, text, mark of a submenu.
class MenuColumns {
public:
    static constexpr int kMarkLeft = 10, kMarkSide = 12;
    static constexpr int kFirstLeft = 27; // of what follows the mark
    static constexpr int kIconSide = 16;

    // Looks at what the items have, without measuring any text.
    explicit MenuColumns(Menu const &);

    int IconLeft() const { return kFirstLeft; }
    int DecoratorLeft() const { return kFirstLeft + (icons ? kIconSide + kGap : 0); }
    int DecoratorWidth() const { return decoratorWidth; }
    int TextLeft() const { return DecoratorLeft() + (decoratorWidth > 0 ? decoratorWidth + kGap : 0); }
    // From the text's right edge to the menu's.
    int RightPad() const { return submenus ? kSubmenuPad : kPlainPad; }

    // The width that shows the texts from the first to the last item whole, and those that look longest among
    // the others: measuring all of a long menu would take longer than showing it. In the current port.
    int NaturalWidth(Menu const &, int firstItem, int lastItem) const;

    static void SetFont(); // of the texts, in the current port

private:
    static constexpr int kGap = 7;
    static constexpr int kPlainPad = 18, kSubmenuPad = 30;
    bool icons = false, submenus = false;
    int decoratorWidth = 0;
};
