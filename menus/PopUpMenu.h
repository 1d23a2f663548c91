// A pop-up menu with its current item, apart from any pane.
//
// Owns or shares one menu, runs it, and works out which of its own items a choice in a submenu stands for.
// What shows it and who hears of it are its subclasses' affair.
#pragma once
#include "frame/PopUpMenuListener.h"
#include "host/Geometry.h"
#include "host/OSMenuHandle.h"
#include "host/UString.h"
#include <boost/shared_ptr.hpp>
#include <memory>
#include <vector>

// Items count from 1; 0 is none. All operations allow an invalid menu and items that do not exist: they do
// nothing then, or answer what is said. The order of the virtual operations is fixed.
class PopUpMenu {
public:
    // What becomes of an item whose text is "-"; any other value stands for kDashIsText.
    enum DashIsSep : int { kDashIsSeparator = 0, kDashIsText = 1 };

    // `privateCopy`: the menu that InitializeMenu takes is this object's own and is cleared with it.
    // `mustHaveSelection`: a menu with items always has a current one.
    PopUpMenu(bool privateCopy, bool mustHaveSelection);
    // Drops the submenus, and the menu if it is its own.
    virtual ~PopUpMenu();
    PopUpMenu(PopUpMenu const &) = delete;
    PopUpMenu &operator=(PopUpMenu const &) = delete;

    // Appends an item or a separator and answers its number, 0 for an invalid menu. The first item becomes
    // the current one, with MenuChanged(1), where there must be one.
    virtual unsigned short AddItem(UString const &, DashIsSep);
    // The same, but nothing becomes current.
    virtual unsigned short AddSeparator();
    // Inserts an item, or a separator for "-", that gets the number; else as AddItem. The number of the
    // current item stays.
    virtual void InsertItem(short index, UString const &, DashIsSep);
    virtual void InsertSeparator(short index); // that gets the number
    // Without the current item its number stays, and so the next one is current, without MenuChanged; if it
    // was the last one, item 1 is current, or none in an empty menu. Behind a deleted item the current one
    // counts one less. Repaints when the current item has gone.
    virtual void DeleteItem(short item);
    // Deletes all items and submenus. No item is current then.
    virtual void DeleteAllItems();
    virtual void SetEnableItem(short item, char on); // item 0: the whole menu
    virtual bool GetEnableItem(short item);          // true for an invalid menu
    // Makes the item current and tells MenuChanged, then repaints; nothing for the current item. A negative
    // number makes none current. Whether the item exists is not looked at.
    virtual void SelectItem(short item);
    virtual short GetSelectedItem();  // 0 for a menu without items
    virtual short CountItems() const; // separators count too
    // Change how the item looks when the menu next opens; repaint nothing.
    virtual void SetItemIcon(short item, short icon);
    virtual void SetItemCheck(short item, bool on);

protected:
    // Hook: what shows the menu has to be drawn again. By default nothing.
    virtual void InvalPane();

public:
    // Whether the item can be chosen: it and the menu are enabled. False for an item that does not exist.
    virtual bool ItemIsEnabled(short item);
    virtual void GetCurItemName(UString &); // empty without a current item

protected:
    // Hooks for drawing: whether item and icon may be looked at, by default true; and whether to draw it
    // enabled and with which icon: those of the current item, or of the menu and 0.
    virtual bool OKToGetCuritemInfo() const;
    virtual void GetCurItemMenuInfo(bool &enabled, short &icon);
    // Hook: over which place the menu opens, in the coordinates of the current pane.
    virtual Rect GetMenuRect() = 0;
    // Hook: the menu is about to be used.
    virtual void AutoSetActivity() = 0;
    // Hook: an item was chosen. `menu` and `name` are those of the submenu that it is in: an invalid handle
    // for a choice from the menu itself, and no name for a submenu that was not made here.
    virtual void ItemSelected(OSMenuHandle &menu, UString const &name, short item) = 0;
    // Hook: another item is current, or none.
    virtual void MenuChanged(short item) = 0;
    // Hook: whether selecting the item changes anything; by default, whether another one is current.
    virtual bool NewSelectionRequiresAction(short item);
    // Hooks: before the menu opens, and after everything else, also when it was dismissed.
    virtual void AboutToDoMenu();
    virtual void DoneWithDoMenu();

public:
    // Becomes a copy of the menu, of its own. The submenus made before go; with the flag no item is current.
    // Nobody is told. A menu that was invalid keeps its selection and its submenus.
    void SetMenu(OSMenuHandle const &, bool resetSelection);
    OSMenuHandle &GetMenuHandle() { return menu; } // the menu itself: what is done to it tells nobody
    short GetMenuID() const { return menuID; }     // that was asked for, also where there is no such menu
    short GetFlags() const { return flags; }       // of the resource, the low 8 bits
    // What the menu answered when it was last open: menu id in the upper 16 bits, item in the lower; 0: it
    // was dismissed; -1: it has not been open, or could not be opened.
    int GetLastPopupResult() const { return lastPopupResult; }
    // Plain stores.
    void SetMustHaveSelection(bool on) { mustHaveSelection = on; }
    void EnableCurrentSelectionCheckmark(bool on) { showsCheckmark = on; } // while the menu is open
    void EnableMenu(bool);                                                 // and repaints

    // Opens the menu and waits for the choice. Answers the number of the item that is current then, or -1
    // when nothing was chosen; an invalid, empty or disabled menu does not open. The order: AboutToDoMenu,
    // AutoSetActivity, the menu, SelectItem, ItemSelected, DoneWithDoMenu. Any of these may delete this
    // object.
    int DoMenu();

    void GetItemName(short item, UString &) const; // empty for an item that does not exist
    void SetItemName(short item, UString const &); // "-" also disables the item
    // The first item of the name; false, and the count plus 1, when there is none. False without effect for
    // an invalid menu.
    bool FindItemByName(UString const &, int &item);
    // Repaints if it is the current item.
    void ApplyDecoratorToItem(short item, boost::shared_ptr<MenuItemDecorator> const &);

    // Appends an item that opens a new, empty submenu, to the menu or to any other one, and answers the
    // submenu. Submenus can be found by their ids only while the menu is open. A choice from a submenu
    // selects, in this menu, the number that its item has in its parent, whichever menu that is.
    OSMenuHandle AppendNewEmptyHierarchicalMenu(UString const &title);
    OSMenuHandle AppendNewEmptyHierarchicalMenu(UString const &title, OSMenuHandle parent);
    // The item in its parent that opens the submenu; false without effect for a submenu not made here.
    bool FindSubMenuItem(OSMenuHandle &submenu, int &item);
    // The submenu of the id, invalid when none made here has it, and the first item of the menu that has its
    // title (one more than there are if none has).
    OSMenuHandle FindSubMenuWithID(short id, short &item);
    // What DoMenu does around the menu: the submenus become those of their items, and can be found.
    void InstallSubMenus();
    void RemoveSubMenus();

protected:
    // Takes the stored menu of the id, a copy or the shared one. The first of its items becomes current where
    // there must be one. Flag 2: no check mark at the current item.
    void InitializeMenu(short resourceFlags, short id);
    short GetCurrentSelection() const { return currentSelection; }
    void SetSelectedItem(short item);   // SelectItem without repainting
    void DeleteOneMenuItem(short item); // and no more: the selection stays

    // Whether a menu still exists, for code that calls what may delete it.
    class Watch {
    public:
        // May outlive the menu.
        explicit Watch(PopUpMenu const &menu)
            : existence(menu.existence) {}
        bool MenuExists() const { return !existence.expired(); } // its destructor has not begun

    private:
        std::weak_ptr<void> existence;
    };

private:
    // A submenu that was made here.
    struct Submenu {
        UString title;
        short parentItem; // in the parent
        short menuID;     // of the submenu
        OSMenuHandle parent;
        OSMenuHandle submenu;
    };
    // The item of the menu that a choice stands for, and what ItemSelected is told of it.
    struct Choice {
        OSMenuHandle submenu;
        UString name;
    };

    bool Exists(short item) const { return menu.IsValid() && item >= 1 && item <= menu.NumMenuItems(); }
    bool IsChosen() const { return currentSelection > 0 && currentSelection <= CountItems(); }
    void SelectFirstIfNeeded();
    void DropSubmenus();
    int RunMenu();
    void SelectChoice(short id, short item, Choice &);
    void SelectLeadingItem(short id, Choice &);

    OSMenuHandle menu;
    std::vector<Submenu> submenus;
    short currentSelection;
    short flags;
    short menuID;
    int lastPopupResult;
    bool isPrivateCopy;
    bool mustHaveSelection;
    bool showsCheckmark;
    std::shared_ptr<void> existence; // ends with the menu
};
