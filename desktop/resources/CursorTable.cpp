#include "desktop/resources/CursorTable.h"
#include "desktop/resources/ResourceTable.h"
#include <limits>

// No cursor is larger.
static int const kLargestHotSpot = 255;

CursorTable const &CursorTable::Present() {
    static ResourceTable<CursorTable> table{[] { return std::vector<std::string>{"cursors.xml"}; }};
    return table.Get();
}

void CursorTable::Read(XmlFile const &file) {
    file.RequireRoot("cursors");
    typedef std::numeric_limits<short> Short;
    for (XmlNode const &node : file.Root().children) {
        if (node.name != "cursor")
            throw file.ErrorAt(node, "<" + node.name + "> is not known here; <cursor> is");
        CursorEntry entry;
        int number = static_cast<int>(file.RequireInteger(node, "number", 0, Short::max()));
        entry.family = static_cast<short>(file.RequireInteger(node, "family", Short::min(), Short::max()));
        entry.icon = static_cast<short>(file.RequireInteger(node, "icon", Short::min(), Short::max()));
        entry.hotH = static_cast<int>(file.RequireInteger(node, "hotH", 0, kLargestHotSpot));
        entry.hotV = static_cast<int>(file.RequireInteger(node, "hotV", 0, kLargestHotSpot));
        entries[number] = entry;
    }
}

CursorEntry const *CursorTable::Find(int number) const {
    auto const found = entries.find(number);
    return found == entries.end() ? nullptr : &found->second;
}
