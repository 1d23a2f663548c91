// The menus that resources hold.
#pragma once
#include "desktop/menus/Menu.h"
#include "desktop/resources/XmlFile.h"
#include <unordered_map>

// From menus/*.xml:
// <menus><menu id="137" title="Rows"><item text="Copy" icon="3"/><separator/>...</menu>...</menus>. A menu of
// a later file takes the place of one of the same id.
class StoredMenus {
public:
    // Those of the present language and directories. Throws ResourceError for a broken file.
    static StoredMenus const &Present();

    void Read(XmlFile const &);       // throws XmlError
    Menu const *Find(short id) const; // null when there is none

private:
    static void ReadItem(XmlFile const &, XmlNode const &, Menu &);
    std::unordered_map<short, Menu> menus;
};
