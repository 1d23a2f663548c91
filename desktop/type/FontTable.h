// The application's font table and the font files it draws on.
#pragma once
#include "desktop/resources/XmlFile.h"
#include <map>
#include <string>
#include <vector>

struct FontFile {
    std::string path;
    int face; // FontFace bits of the one face that is in it
    bool operator==(FontFile const &other) const { return path == other.path && face == other.face; }
};

// From fonts.xml: <fonts directory="..."> with <file name="..." style="bold"/> and <font index="0"
// family="..." size="12" style="plain"/>. A style is "plain", also when absent, or some of "bold", "italic",
// "underline" and "condensed". Files are relative to the directory, the directory to the XML file's own.
class FontTable {
public:
    struct Entry {
        std::string family;
        int face;
        int size;
    };

    void Read(XmlFile const &); // throws XmlError
    std::vector<FontFile> const &Files() const { return files; }
    std::map<int, Entry> const &Entries() const { return entries; }

private:
    std::vector<FontFile> files;
    std::map<int, Entry> entries;
};

// The table of the present resources; throws ResourceError for a broken file.
FontTable const &TheFontTable();
