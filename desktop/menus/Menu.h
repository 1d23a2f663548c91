// What a menu holds.
#pragma once
#include "host/MenuItemDecorator.h"
#include "host/UString.h"
#include <boost/shared_ptr.hpp>
#include <cstddef>
#include <memory>
#include <vector>

struct MenuItem {
    UString text;
    short icon = 0;     // index in the family of menu icons; 0: none
    short submenu = 0;  // id of the menu that it opens; 0: none
    int attributes = 0; // kept for whoever set them
    bool enabled = true;
    bool checked = false;
    bool separator = false;
    boost::shared_ptr<MenuItemDecorator> decorator;

    static MenuItem Separator() {
        MenuItem item;
        item.separator = true;
        item.enabled = false;
        return item;
    }
};

// A menu copied as a value: the items are shared until one of the copies changes them. So a pop-up keeps what
// it shows, whatever becomes of the menu meanwhile.
class Menu {
public:
    typedef std::vector<MenuItem> Items;
    static constexpr std::size_t kMostItems = 32767; // item numbers have 16 bits

    short id = 0;
    UString title;
    bool enabled = true;

    // Item numbers count from 1, as everywhere.
    short Count() const { return static_cast<short>(items->size()); }
    Items const &All() const { return *items; }
    // Null for an item that does not exist.
    MenuItem const *Find(int item) const {
        return item < 1 || item > Count() ? nullptr : &(*items)[static_cast<std::size_t>(item) - 1];
    }
    // The same, to be changed.
    MenuItem *Change(int item) { return Find(item) ? &Own()[static_cast<std::size_t>(item) - 1] : nullptr; }
    // Cut to the items that there are: 0 is the beginning. A full menu stays as it is.
    void Insert(int afterItem, MenuItem const &);
    void Append(MenuItem const &item) { Insert(Count(), item); }
    void Delete(int item);

    // Whether a person may choose the item, or open its submenu.
    bool CanChoose(int item) const {
        MenuItem const *const found = enabled ? Find(item) : nullptr;
        return found && found->enabled && !found->separator;
    }
    // Whether both still show the same items.
    bool SharesItems(Menu const &other) const { return items == other.items; }

private:
    Items &Own() {
        if (items.use_count() > 1)
            items = std::make_shared<Items>(*items);
        return *items;
    }
    std::shared_ptr<Items> items = std::make_shared<Items>();
};
