#include "menus/NonPanePopupMenu.h"

namespace {

short const kEmptyMenu = 137; // the stored menu without items
short const kNoFlags = 0;
short const kNothingChosen = -1;

} // namespace

NonPanePopupMenu::NonPanePopupMenu(int menuID, bool privateCopy, bool mustHaveSelection)
    : PopUpMenu(privateCopy, mustHaveSelection)
    , menuRect()
    , chosenItem(kNothingChosen) {
    InitializeMenu(kNoFlags, static_cast<short>(menuID));
}

NonPanePopupMenu::NonPanePopupMenu(bool mustHaveSelection)
    : NonPanePopupMenu(kEmptyMenu, true, mustHaveSelection) {}

// False when this object has gone meanwhile.
bool NonPanePopupMenu::RunMenu(Rect const &place) {
    menuRect = place;
    chosenMenu.clear();
    chosenItem = kNothingChosen;
    Watch const watch(*this);
    DoMenu();
    return watch.MenuExists();
}

bool NonPanePopupMenu::RunPopup(Rect const &place, OSMenuHandle &menu, short &item) {
    if (!RunMenu(place) || !chosenMenu.IsValid())
        return false;
    menu = chosenMenu;
    item = chosenItem;
    return item > 0;
}

bool NonPanePopupMenu::RunPopup(Rect const &place, short &menuID, short &item) {
    OSMenuHandle menu;
    bool const chosen = RunPopup(place, menu, item);
    if (menu.IsValid())
        menuID = menu.GetMenuID();
    return chosen;
}

void NonPanePopupMenu::SelectItem(short item) { SetSelectedItem(item); }

Rect NonPanePopupMenu::GetMenuRect() { return menuRect; }

void NonPanePopupMenu::AutoSetActivity() {}

void NonPanePopupMenu::ItemSelected(OSMenuHandle &menu, UString const &, short item) {
    chosenMenu = menu.IsValid() ? menu : GetMenuHandle();
    chosenItem = item;
}

void NonPanePopupMenu::MenuChanged(short) {}
