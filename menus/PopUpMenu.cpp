#include "menus/PopUpMenu.h"
#include "frame/ResourceReading.h"
#include <set>

namespace {

int const kPlainText = 0x40; // attribute of every ordinary item
int const kNothingChosen = -1;
short const kNoCheckmarkFlag = 2;
short const kFlagBits = 0xFF;
short const kAsSubmenu = -1; // for InsertMenuBeforeMenuID

bool IsDash(UString const &text) { return text == ResourceKey("-"); }

short Before(short item) { return static_cast<short>(item - 1); }

// The installed menu of the id, else the stored one; invalid when it is neither.
OSMenuHandle FindMenu(short id) {
    OSMenuHandle found;
    if (!OSMenuHandle::FindInMenuList(id, found) && OSMenuHandle::IsSingletonMenu(id))
        found = OSMenuHandle::GetSingletonMenu(id);
    return found;
}

// Whether the id is that of a submenu below the menu. Only stored menus are looked into. Those already seen
// are left out: menus may be below themselves.
bool LiesBelow(short id, OSMenuHandle const &top, std::set<short> &seen) {
    for (short item = top.NumMenuItems(); item >= 1; --item) {
        if (!top.IsMenuItemHierarchical(item))
            continue;
        short const next = top.GetMenuItemHierarchicalID(item);
        if (next == id)
            return true;
        if (!OSMenuHandle::IsSingletonMenu(next) || !seen.insert(next).second)
            continue;
        OSMenuHandle const submenu = OSMenuHandle::GetSingletonMenu(next);
        if (submenu.IsValid() && LiesBelow(id, submenu, seen))
            return true;
    }
    return false;
}

} // namespace

PopUpMenu::PopUpMenu(bool privateCopy, bool mustHaveSelection_)
    : currentSelection(0)
    , flags(0)
    , menuID(0)
    , lastPopupResult(kNothingChosen)
    , isPrivateCopy(privateCopy)
    , mustHaveSelection(mustHaveSelection_)
    , showsCheckmark(true)
    , existence(std::make_shared<char>()) {}

PopUpMenu::~PopUpMenu() {
    existence.reset();
    DropSubmenus();
    if (isPrivateCopy && menu.IsValid())
        menu.clear();
}

void PopUpMenu::DropSubmenus() {
    for (Submenu &made : submenus)
        made.submenu.clear();
    submenus.clear();
}

// The menu

void PopUpMenu::InitializeMenu(short resourceFlags, short id) {
    flags = resourceFlags;
    menuID = id;
    menu = isPrivateCopy ? OSMenuHandle::CopyPrototypeMenu(id) : OSMenuHandle::GetSingletonMenu(id);
    // This comes before the flags are read: whoever hears of it finds all their bits.
    if (menu.IsValid() && menu.NumMenuItems() >= 1 && mustHaveSelection && NewSelectionRequiresAction(1)) {
        currentSelection = 1;
        Watch const watch(*this);
        MenuChanged(1);
        if (!watch.MenuExists())
            return;
    }
    showsCheckmark = (flags & kNoCheckmarkFlag) == 0;
    flags = static_cast<short>(flags & kFlagBits);
}

void PopUpMenu::SetMenu(OSMenuHandle const &other, bool resetSelection) {
    OSMenuHandle const source = other; // it may be this menu or one of its submenus
    if (menu.IsValid()) {
        DropSubmenus();
        if (isPrivateCopy)
            menu.clear();
        if (resetSelection)
            currentSelection = 0;
    }
    isPrivateCopy = true;
    menu.CloneMenu(source);
    menuID = menu.GetMenuID();
}

void PopUpMenu::EnableMenu(bool on) {
    menu.SetEnabled(on);
    InvalPane();
}

// Items

void PopUpMenu::SelectFirstIfNeeded() {
    if (currentSelection > 0 || !mustHaveSelection || !NewSelectionRequiresAction(1))
        return;
    currentSelection = 1;
    MenuChanged(1);
}

unsigned short PopUpMenu::AddItem(UString const &text, DashIsSep dash) {
    if (!menu.IsValid())
        return 0;
    if (dash == kDashIsSeparator && IsDash(text))
        menu.AppendMenuSeparator();
    else
        menu.AppendItem(text, kPlainText);
    unsigned short const added = static_cast<unsigned short>(menu.NumMenuItems());
    SelectFirstIfNeeded();
    return added;
}

unsigned short PopUpMenu::AddSeparator() {
    if (!menu.IsValid())
        return 0;
    menu.AppendMenuSeparator();
    return static_cast<unsigned short>(menu.NumMenuItems());
}

void PopUpMenu::InsertItem(short index, UString const &text, DashIsSep dash) {
    if (!menu.IsValid())
        return;
    if (dash == kDashIsSeparator && IsDash(text)) {
        menu.InsertMenuSeparator(Before(index));
    } else {
        menu.InsertItem(Before(index), text);
        menu.ChangeItemAttributes(index, kPlainText, 0);
    }
    SelectFirstIfNeeded();
}

void PopUpMenu::InsertSeparator(short index) { menu.InsertMenuSeparator(Before(index)); }

void PopUpMenu::DeleteOneMenuItem(short item) {
    if (Exists(item))
        menu.DeleteItem(item);
}

void PopUpMenu::DeleteItem(short item) {
    if (!Exists(item))
        return;
    short const before = menu.NumMenuItems();
    menu.DeleteItem(item);
    if (item == currentSelection) {
        Watch const watch(*this);
        if (item == before)
            SetSelectedItem(static_cast<short>(before == 1 ? 0 : 1));
        if (watch.MenuExists())
            InvalPane();
    } else if (currentSelection > item) {
        SetSelectedItem(Before(currentSelection));
    }
}

void PopUpMenu::DeleteAllItems() {
    if (menu.IsValid()) {
        for (short item = menu.NumMenuItems(); item >= 1; --item)
            menu.DeleteItem(item);
        if (NewSelectionRequiresAction(0)) {
            currentSelection = 0;
            Watch const watch(*this);
            MenuChanged(0);
            if (!watch.MenuExists())
                return;
        }
    }
    DropSubmenus();
}

void PopUpMenu::SetEnableItem(short item, char on) {
    if (!menu.IsValid())
        return;
    if (item == 0)
        menu.SetEnabled(on != 0);
    else if (Exists(item))
        menu.SetItemEnabled(item, on != 0);
}

bool PopUpMenu::GetEnableItem(short item) { return !menu.IsValid() || menu.IsItemEnabled(item); }

bool PopUpMenu::ItemIsEnabled(short item) {
    return Exists(item) && menu.IsEnabled() && menu.IsItemEnabled(item);
}

short PopUpMenu::CountItems() const { return static_cast<short>(menu.IsValid() ? menu.NumMenuItems() : 0); }

void PopUpMenu::SetItemIcon(short item, short icon) {
    if (Exists(item))
        menu.SetMenuItemIcon(item, icon);
}

void PopUpMenu::SetItemCheck(short item, bool on) {
    if (menu.IsValid() && item >= 1)
        menu.SetMenuItemCheck(item, on);
}

void PopUpMenu::GetItemName(short item, UString &name) const {
    if (Exists(item))
        menu.GetMenuItemText(item, name);
    else
        name.clear();
}

void PopUpMenu::SetItemName(short item, UString const &name) {
    if (!Exists(item))
        return;
    menu.SetMenuItemText(item, name);
    if (IsDash(name))
        menu.DisableItem(item);
}

bool PopUpMenu::FindItemByName(UString const &name, int &item) {
    if (!menu.IsValid())
        return false;
    int const count = menu.NumMenuItems();
    UString text;
    for (item = 1; item <= count; ++item) {
        menu.GetMenuItemText(static_cast<short>(item), text);
        if (text == name)
            return true;
    }
    return false;
}

void PopUpMenu::ApplyDecoratorToItem(short item, boost::shared_ptr<MenuItemDecorator> const &decorator) {
    if (!Exists(item))
        return;
    Watch const watch(*this);
    if (item == currentSelection)
        InvalPane();
    if (watch.MenuExists())
        menu.ApplyDecoratorToItem(item, decorator);
}

// The current item

bool PopUpMenu::NewSelectionRequiresAction(short item) { return item != currentSelection; }

void PopUpMenu::SetSelectedItem(short item) {
    if (!NewSelectionRequiresAction(item))
        return;
    currentSelection = static_cast<short>(item < 0 ? 0 : item);
    MenuChanged(currentSelection);
}

void PopUpMenu::SelectItem(short item) {
    if (!NewSelectionRequiresAction(item))
        return;
    Watch const watch(*this);
    currentSelection = static_cast<short>(item < 0 ? 0 : item);
    MenuChanged(currentSelection);
    if (watch.MenuExists())
        InvalPane();
}

short PopUpMenu::GetSelectedItem() { return static_cast<short>(CountItems() == 0 ? 0 : currentSelection); }

void PopUpMenu::GetCurItemName(UString &name) {
    if (IsChosen())
        GetItemName(currentSelection, name);
    else
        name.clear();
}

bool PopUpMenu::OKToGetCuritemInfo() const { return true; }

void PopUpMenu::GetCurItemMenuInfo(bool &enabled, short &icon) {
    if (OKToGetCuritemInfo() && menu.IsValid() && IsChosen()) {
        enabled = ItemIsEnabled(currentSelection);
        icon = menu.GetMenuItemIcon(currentSelection);
    } else {
        enabled = menu.IsEnabled();
        icon = 0;
    }
}

void PopUpMenu::InvalPane() {}

void PopUpMenu::AboutToDoMenu() {}

void PopUpMenu::DoneWithDoMenu() {}

// Submenus

OSMenuHandle PopUpMenu::AppendNewEmptyHierarchicalMenu(UString const &title) {
    return AppendNewEmptyHierarchicalMenu(title, menu);
}

// By value, as the interface has it. NOLINTNEXTLINE(performance-unnecessary-value-param)
OSMenuHandle PopUpMenu::AppendNewEmptyHierarchicalMenu(UString const &title, OSMenuHandle parent) {
    OSMenuHandle submenu = OSMenuHandle::CreateNewHierarchicalMenu();
    submenu.SetMenuTitle(title);
    parent.AppendItem(title);
    submenus.push_back({title, parent.NumMenuItems(), submenu.GetMenuID(), parent, submenu});
    return submenu;
}

bool PopUpMenu::FindSubMenuItem(OSMenuHandle &submenu, int &item) {
    for (Submenu const &made : submenus) {
        if (made.submenu == submenu) {
            item = made.parentItem;
            return true;
        }
    }
    return false;
}

OSMenuHandle PopUpMenu::FindSubMenuWithID(short id, short &item) {
    for (Submenu const &made : submenus) {
        if (made.submenu.GetMenuID() != id)
            continue;
        int found = 0;
        FindItemByName(made.title, found);
        if (menu.IsValid())
            item = static_cast<short>(found);
        return made.submenu;
    }
    return OSMenuHandle();
}

void PopUpMenu::InstallSubMenus() {
    for (Submenu &made : submenus) {
        made.parent.SetMenuItemHierarchicalID(made.parentItem, made.menuID);
        made.submenu.InsertMenuBeforeMenuID(kAsSubmenu);
    }
}

void PopUpMenu::RemoveSubMenus() {
    for (Submenu &made : submenus)
        made.submenu.RemoveFromMenuList();
}

// Running

// The menu with its submenus and the mark at the current item, all of which are as they were afterwards. They
// are kept by copies: whatever runs while the menu is open may change or delete this object.
int PopUpMenu::RunMenu() {
    struct Marked {
        Marked(OSMenuHandle const &menu_, short item_)
            : menu(menu_)
            , item(item_) {
            if (item != 0)
                menu.SetMenuItemCheck(item, true);
        }
        ~Marked() {
            if (item != 0)
                menu.SetMenuItemCheck(item, false);
        }
        OSMenuHandle menu;
        short const item; // 0: none
    };
    struct Attached {
        explicit Attached(PopUpMenu &owner)
            : submenus(owner.submenus) {
            owner.InstallSubMenus();
        }
        ~Attached() {
            for (Submenu &made : submenus)
                made.submenu.RemoveFromMenuList();
        }
        std::vector<Submenu> submenus;
    };
    bool const marks =
        currentSelection >= 1 && showsCheckmark && !menu.IsMenuItemHierarchical(currentSelection);
    Marked const marked(menu, static_cast<short>(marks ? currentSelection : 0));
    Rect place = GetMenuRect();
    Attached const attached(*this);
    OSMenuHandle running = menu;
    return RunPopupMenu(running, currentSelection, &place);
}

int PopUpMenu::DoMenu() {
    lastPopupResult = kNothingChosen;
    if (!menu.IsValid() || menu.NumMenuItems() == 0 || !menu.IsEnabled())
        return kNothingChosen;
    Watch const watch(*this);
    AboutToDoMenu();
    if (watch.MenuExists())
        AutoSetActivity();
    if (!watch.MenuExists())
        return kNothingChosen;
    int const chosen = RunMenu();
    if (!watch.MenuExists())
        return kNothingChosen;
    lastPopupResult = chosen;
    unsigned int const word = static_cast<unsigned int>(chosen);
    short const id = static_cast<short>(static_cast<unsigned short>(word >> 16));
    short const item = static_cast<short>(static_cast<unsigned short>(word));
    if (id == 0) {
        DoneWithDoMenu();
        return kNothingChosen;
    }
    Choice choice;
    SelectChoice(id, item, choice);
    if (!watch.MenuExists())
        return kNothingChosen;
    int const result = currentSelection;
    ItemSelected(choice.submenu, choice.name, item);
    if (watch.MenuExists())
        DoneWithDoMenu();
    return result;
}

// Makes the item current that the choice stands for.
void PopUpMenu::SelectChoice(short id, short item, Choice &choice) {
    Watch const watch(*this);
    for (Submenu const &made : submenus) {
        if (made.menuID != id)
            continue;
        choice.name = made.title;
        choice.submenu = made.submenu;
        SelectItem(made.parentItem); // which may change the submenus
        break;
    }
    // A submenu without a title is looked for further on, like one that was not made here.
    if (!watch.MenuExists() || !choice.name.empty())
        return;
    if (id == menu.GetMenuID())
        SelectItem(item);
    else
        SelectLeadingItem(id, choice);
}

// The last item that leads to the menu of the id; without one the selection stays.
void PopUpMenu::SelectLeadingItem(short id, Choice &choice) {
    for (short item = CountItems(); item >= 1; --item) {
        if (!menu.IsMenuItemHierarchical(item))
            continue;
        short const next = menu.GetMenuItemHierarchicalID(item);
        OSMenuHandle const submenu = FindMenu(next);
        std::set<short> seen = {next};
        if (next != id && !(submenu.IsValid() && LiesBelow(id, submenu, seen)))
            continue;
        choice.submenu = submenu; // which the item opens, however far below the choice was made
        SelectItem(item);
        return;
    }
}
