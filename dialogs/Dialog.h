// A dialog as it was read and checked, before any pane is made.
#pragma once
#include "desktop/Desktop.h"
#include "dialogs/LoadError.h"
#include "host/XMLLib.h"
#include <boost/shared_ptr.hpp>
#include <map>
#include <string>
#include <vector>

class ItemType;

struct DialogItem {
    ItemType const *type = nullptr;
    int id = 0; // 0: none was given
    LoadError::Place place;
    std::map<std::string, LoadError::Place> keyPlaces; // by the names of the item's own keys
    boost::shared_ptr<XMLLib::ContainerItem> keys;
    std::vector<DialogItem> items; // of a type that holds items

    // The place of the key; that of the item for a key that is not there.
    LoadError::Place PlaceOf(std::string const &key) const;
};

struct Dialog {
    std::string file;
    GlogOptions options;
    int minWidth = 0, minHeight = 0, maxWidth = 0, maxHeight = 0; // 0: no limit
    std::vector<DialogItem> items;
};
