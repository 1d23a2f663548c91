// Which icon shows each cursor.
#pragma once
#include "desktop/resources/XmlFile.h"
#include <map>

struct CursorEntry {
    short family, icon;
    int hotH, hotV; // logical pixels from the icon's top left
};

// From cursors.xml: <cursors><cursor number="..." family="..." icon="..." hotH="..."
// hotV="..."/>...</cursors>. Other attributes are for readers.
class CursorTable {
public:
    // The table of the resources that are open; throws ResourceError for a broken file.
    static CursorTable const &Present();

    void Read(XmlFile const &);                // throws XmlError
    CursorEntry const *Find(int number) const; // null when absent

private:
    std::map<int, CursorEntry> entries;
};
