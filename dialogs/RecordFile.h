// Dialogs of binary records.
#pragma once
#include "dialogs/LoadError.h"
#include <cstddef>
#include <string>
#include <vector>

class ItemType;
class RecordBytes;
struct glogRec;

// Numbers have 16 bits, the low byte first:
//
//     "GLOGREC1"
//     width, height of the glog in pixels
//     count of the items
//     for each item its length in bytes, then as many bytes: the record as the pane's header tells it, its
//     first number being its kind; after the record of a label its text in UTF-8
//
// Items are numbered from 1 as they follow each other.
class RecordFile {
public:
    static std::size_t const kMagicSize = 8;                   // bytes
    static bool HasMagic(void const *bytes, std::size_t size); // whether these are records at all

    // Checks header, lengths and kinds; throws LoadError. The bytes stay the caller's and must outlive this
    // object.
    RecordFile(void const *bytes, std::size_t size, std::string const &name);

    int Width() const { return width; }   // of the glog, in pixels
    int Height() const { return height; } // likewise
    // Makes all panes in the glog. Throws LoadError; what was made by then stays with the glog.
    void MakePanes(glogRec *) const;

private:
    struct Entry {
        ItemType const *type;
        unsigned char const *bytes;
        std::size_t size;
        LoadError::Place place;
    };

    static Entry ReadEntry(RecordBytes &, unsigned char const *start, int id);
    static LoadError::Place PlaceOf(Entry const &, std::string const &key);
    void Make(glogRec *, Entry const &, int id) const;

    int width = 0, height = 0;
    std::vector<Entry> entries;
};
