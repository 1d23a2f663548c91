// Menus, and the pop-up that lets the user choose from one.
#pragma once
#include "host/Geometry.h"
#include "host/UString.h"
#include <boost/shared_ptr.hpp>

class MenuItemDecorator;

// A counted reference to a menu, or to none (invalid). Copies name the same menu, which goes with its last
// reference.
//
// Items count from 1; separators are items too. An item that does not exist reads as empty, disabled and
// without icon or submenu, and changing it has no effect. The same holds for all operations on an invalid
// handle.
class OSMenuHandle {
public:
    OSMenuHandle(); // invalid
    OSMenuHandle(OSMenuHandle const &);
    ~OSMenuHandle();
    OSMenuHandle &operator=(OSMenuHandle const &);
    bool operator==(OSMenuHandle const &) const; // whether both name the same menu, or both none

    // A new menu without items, under an id of its own, which is not 0.
    static OSMenuHandle CreateNewHierarchicalMenu();
    // A copy of the stored menu, for the caller alone; invalid when there is none of that id.
    static OSMenuHandle CopyPrototypeMenu(short id);
    // The stored menu itself, shared by all who ask for it; invalid when there is none of that id.
    static OSMenuHandle GetSingletonMenu(short id);
    // Whether GetSingletonMenu knows the id.
    static bool IsSingletonMenu(short id);
    // Looks for the id among the installed menus. True and the menu, or false and `out` untouched.
    static bool FindInMenuList(short id, OSMenuHandle &out);

    bool IsValid() const;    // whether it names a menu
    void clear();            // drops this reference; other handles keep theirs
    short GetMenuID() const; // 0 for an invalid handle
    // Names a new menu from now on: a copy of the other, with its id and its items. Invalid when the other
    // is.
    void CloneMenu(OSMenuHandle const &);

    // Installs the menu so that its id can be found: before the installed menu of that id, or as a submenu
    // for -1. One that is installed several times has to be removed as often; the list holds no reference.
    void InsertMenuBeforeMenuID(short id);
    void RemoveFromMenuList();

    // A disabled menu shows its items grey and lets none be chosen.
    void SetEnabled(bool);
    bool IsEnabled() const;
    void DisableItem(short item);
    void SetItemEnabled(short item, bool);
    bool IsItemEnabled(short item) const;

    void SetMenuItemText(short item, UString const &); // as it stands, without marks for keys or styles
    void GetMenuItemText(short item, UString &) const; // replaces the string
    void SetMenuItemIcon(short item, short icon);      // index in icon family 2006; 0: none
    short GetMenuItemIcon(short item) const;           // 0: none

    // An item is hierarchical when it opens a submenu: the installed menu of the item's hierarchical id.
    bool IsMenuItemHierarchical(short item) const;
    void SetMenuItemHierarchicalID(short item, short menuID); // 0: none
    short GetMenuItemHierarchicalID(short item) const;

    void ApplyDecoratorToItem(short item, boost::shared_ptr<MenuItemDecorator> const &); // shared
    void SetMenuItemCheck(short item, bool); // the mark before the text

    // Inserts an item; after item 0 is at the beginning, after the last or beyond at the end.
    void InsertItem(short afterItem, UString const &);
    // Appends an item; a menu of 32767 items takes no more. Attribute bits are kept and change nothing here:
    // every text is taken as it stands, which 0x40 asks for.
    void AppendItem(UString const &, int attributes);
    void AppendItem(UString const &);
    void DeleteItem(short item);
    void ChangeItemAttributes(short item, int set, int clear); // attribute bits, as above
    void InsertMenuSeparator(short afterItem);
    void AppendMenuSeparator();
    void SetMenuTitle(UString const &);
    short NumMenuItems() const;

private:
    friend struct MenuAccess;
    struct Rep;
    Rep *rep;
};

// Opens the menu with its current item over the rectangle, in the current pane's coordinates, and waits for
// the choice. Answers the id of the menu that was chosen from, it or a submenu, in the upper 16 bits and the
// item in the lower, or 0 when nothing was chosen. A current item of 0, or one that does not exist, means
// none: the menu then opens with its first item there. Without a window, while the window is being drawn, and
// while another menu is open nothing opens, and nothing is chosen.
//
// The mouse chooses by one press that is held, or by clicks; the wheel scrolls. Keys: the arrows, Home, End
// and Page keys, Return or the space bar to choose, Escape, and letters for the item that begins with them. A
// click elsewhere and the loss of the window's activation dismiss the menu.
int RunPopupMenu(OSMenuHandle &, short currentItem, Rect *);
