#include "desktop/menus/StoredMenus.h"
#include "desktop/resources/LanguageFiles.h"
#include "desktop/resources/ResourceTable.h"
#include "desktop/resources/Utf.h"
#include <limits>

namespace {

long long const kGreatestNumber = std::numeric_limits<short>::max();

short OptionalNumber(XmlFile const &file, XmlNode const &node, char const *attribute) {
    if (!node.Attribute(attribute))
        return 0;
    return static_cast<short>(file.RequireInteger(node, attribute, 0, kGreatestNumber));
}

bool OptionalFlag(XmlFile const &file, XmlNode const &node, char const *attribute) {
    return node.Attribute(attribute) && file.RequireInteger(node, attribute, 0, 1) != 0;
}

UString OptionalText(XmlNode const &node, char const *attribute) {
    std::string const *const text = node.Attribute(attribute);
    return text ? Utf::FromUtf8(*text) : UString();
}

} // namespace

StoredMenus const &StoredMenus::Present() {
    static ResourceTable<StoredMenus> table{[] { return LanguageFiles("menus"); }};
    return table.Get();
}

void StoredMenus::Read(XmlFile const &file) {
    file.RequireRoot("menus");
    for (XmlNode const &node : file.Root().children) {
        if (node.name != "menu")
            throw file.ErrorAt(node, "<" + node.name + "> is not known here; <menu> is");
        Menu menu;
        menu.id = static_cast<short>(file.RequireInteger(node, "id", 1, kGreatestNumber));
        menu.title = OptionalText(node, "title");
        for (XmlNode const &item : node.children)
            ReadItem(file, item, menu);
        menus[menu.id] = menu;
    }
}

void StoredMenus::ReadItem(XmlFile const &file, XmlNode const &node, Menu &menu) {
    if (menu.All().size() == Menu::kMostItems)
        throw file.ErrorAt(node, "a menu has at most " + std::to_string(Menu::kMostItems) + " items");
    if (node.name == "separator") {
        menu.Append(MenuItem::Separator());
        return;
    }
    if (node.name != "item")
        throw file.ErrorAt(node, "<" + node.name + "> is not known here; <item> and <separator> are");
    MenuItem item;
    item.text = Utf::FromUtf8(file.RequireText(node, "text"));
    item.icon = OptionalNumber(file, node, "icon");
    item.submenu = OptionalNumber(file, node, "submenu");
    item.checked = OptionalFlag(file, node, "checked");
    item.enabled = !OptionalFlag(file, node, "disabled");
    menu.Append(item);
}

Menu const *StoredMenus::Find(short id) const {
    auto const found = menus.find(id);
    return found == menus.end() ? nullptr : &found->second;
}
