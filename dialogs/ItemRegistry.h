// The kinds of items that dialogs may hold.
#pragma once
#include "dialogs/ItemType.h"
#include <map>
#include <string>
#include <vector>

// One for the process. Holds the stock types from the start; a program adds its own before it loads dialogs
// that use them.
class ItemRegistry {
public:
    static ItemRegistry &Instance(); // one for the process

    // A type of a name that is taken replaces the former one. Throws std::invalid_argument for a type without
    // name or maker, for one whose keys repeat those that every item has, and for a record kind of another
    // type.
    void Add(ItemType const &);

    // Valid until a type of that name is added; null when there is none.
    ItemType const *Find(std::string const &name) const;
    // The type whose records begin with this number; null when there is none.
    ItemType const *FindByRecord(int firstNumber) const;
    std::vector<std::string> Names() const; // in alphabetical order

private:
    ItemRegistry();
    std::map<std::string, ItemType> types;
};
