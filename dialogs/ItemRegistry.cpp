#include "dialogs/ItemRegistry.h"
#include "dialogs/CommonKeys.h"
#include "dialogs/StockItems.h"
#include <stdexcept>

ItemRegistry::ItemRegistry() {
    AddButtonItems(*this);
    AddChoiceItems(*this);
    AddIconItems(*this);
    AddBoxItems(*this);
    AddLabelItems(*this);
    AddStringItems(*this);
    AddGroupItems(*this);
    AddScrollItems(*this);
    AddScrolledItems(*this);
    AddMenuItems(*this);
    AddTabItems(*this);
    AddSelectItems(*this);
    AddListItems(*this);
    AddGraphicItems(*this);
    AddThreeDItems(*this);
    AddGraphItems(*this);
    AddZoomItems(*this);
    AddTextItems(*this);
}

ItemRegistry &ItemRegistry::Instance() {
    static ItemRegistry registry;
    return registry;
}

void ItemRegistry::Add(ItemType const &type) {
    if (type.name.empty() || !type.maker)
        throw std::invalid_argument("the item type \"" + type.name + "\" lacks a name or a maker");
    for (std::string const &key : CommonKeys::List().Names()) {
        if (type.keys.Find(key))
            throw std::invalid_argument("the item type " + type.name + " has a key " + key +
                                        ", which every item has");
    }
    ItemType const *const sameRecords = type.recordMaker ? FindByRecord(type.recordKind) : nullptr;
    if (sameRecords && sameRecords->name != type.name)
        throw std::invalid_argument("records of kind " + std::to_string(type.recordKind) + " are those of " +
                                    sameRecords->name);
    types.insert_or_assign(type.name, type);
}

ItemType const *ItemRegistry::Find(std::string const &name) const {
    auto const found = types.find(name);
    return found == types.end() ? nullptr : &found->second;
}

ItemType const *ItemRegistry::FindByRecord(int firstNumber) const {
    for (auto const &[name, type] : types) {
        if (type.recordMaker && (firstNumber & type.recordKindMask) == type.recordKind)
            return &type;
    }
    return nullptr;
}

std::vector<std::string> ItemRegistry::Names() const {
    std::vector<std::string> names;
    for (auto const &[name, type] : types)
        names.push_back(name);
    return names;
}
