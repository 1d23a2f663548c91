#include "dialogs/Dialog.h"

LoadError::Place DialogItem::PlaceOf(std::string const &key) const {
    auto const found = keyPlaces.find(key);
    LoadError::Place where = found == keyPlaces.end() ? place : found->second;
    where.key = key;
    return where;
}
