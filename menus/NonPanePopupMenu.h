// A pop-up menu that any code can open at a place, without a pane.
#pragma once
#include "menus/PopUpMenu.h"

class NonPanePopupMenu : public PopUpMenu {
public:
    // A copy of the stored menu, or the shared one. Without one of the id the menu is invalid and never
    // opens.
    NonPanePopupMenu(int menuID, bool privateCopy, bool mustHaveSelection);
    // An empty menu of its own.
    explicit NonPanePopupMenu(bool mustHaveSelection);

    // Opens the menu over the rectangle, in the coordinates of the current pane. True when an item was
    // chosen, with its number and its menu: this one or a submenu. Without a choice false, and nothing is
    // written.
    bool RunPopup(Rect const &, short &menuID, short &item);
    bool RunPopup(Rect const &, OSMenuHandle &menu, short &item);

    void SelectItem(short item) override; // without repainting: there is no pane

protected:
    Rect GetMenuRect() override;
    void AutoSetActivity() override;
    void ItemSelected(OSMenuHandle &, UString const &, short item) override;
    void MenuChanged(short item) override;

private:
    bool RunMenu(Rect const &);

    Rect menuRect;
    OSMenuHandle chosenMenu; // invalid when nothing was chosen
    short chosenItem;        // -1 then
};
