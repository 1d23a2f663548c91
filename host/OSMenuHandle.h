#pragma once
#include <boost/shared_ptr.hpp>
#include "host/Geometry.h"
#include "host/UString.h"

class MenuItemDecorator;

class OSMenuHandle {
public:
    OSMenuHandle();
    OSMenuHandle(OSMenuHandle const &);
    ~OSMenuHandle();
    OSMenuHandle &operator=(OSMenuHandle const &);
    bool operator==(OSMenuHandle const &) const;

    static OSMenuHandle CreateNewHierarchicalMenu();
    static OSMenuHandle CopyPrototypeMenu(short id);
    static OSMenuHandle GetSingletonMenu(short id);
    static bool IsSingletonMenu(short id);
    static bool FindInMenuList(short id, OSMenuHandle &out);

    bool IsValid() const;
    void clear();
    short GetMenuID() const;
    void CloneMenu(OSMenuHandle const &);
    void InsertMenuBeforeMenuID(short id);
    void RemoveFromMenuList();
    void SetEnabled(bool);
    bool IsEnabled() const;
    void DisableItem(short item);
    void SetItemEnabled(short item, bool);
    bool IsItemEnabled(short item) const;
    void SetMenuItemText(short item, UString const &);
    void GetMenuItemText(short item, UString &) const;
    void SetMenuItemIcon(short item, short icon);
    short GetMenuItemIcon(short item) const;
    bool IsMenuItemHierarchical(short item) const;
    void SetMenuItemHierarchicalID(short item, short menuID);
    short GetMenuItemHierarchicalID(short item) const;
    void ApplyDecoratorToItem(short item, boost::shared_ptr<MenuItemDecorator> const &);
    void SetMenuItemCheck(short item, bool);
    void InsertItem(short afterItem, UString const &);
    void AppendItem(UString const &, int attributes);
    void AppendItem(UString const &);
    void DeleteItem(short item);
    void ChangeItemAttributes(short item, int set, int clear);
    void InsertMenuSeparator(short afterItem);
    void AppendMenuSeparator();
    void SetMenuTitle(UString const &);
    short NumMenuItems() const;
private:
    struct Rep;
    Rep *rep;
};

int RunPopupMenu(OSMenuHandle &, short currentItem, Rect *);
