// How wide names are, kept for the whole program.
#pragma once
#include "host/OSFont.h"
#include "host/TextLayout.h"
#include "host/UString.h"
#include <array>
#include <cstddef>
#include <vector>

// A name that was measured once is not shaped again for its width, in whichever pane it stands. Nothing is
// ever forgotten. A row that is being fitted asks for the same names again and again: where each was found
// last is looked at first.
class TabNameWidths {
public:
    static TabNameWidths &Instance(); // one for the process

    // In pixels. A name that is not known yet is shaped in the layout.
    int WidthOf(UString const &, OS::TextLayout &, OS::Font::FamilyID const &, short style, short size);

private:
    struct Entry {
        UString text;
        OS::Font::FamilyID font;
        short style, size;
        int width;
    };
    // What is looked for, without copies.
    struct Key {
        UString const &text;
        unsigned int font;
        short style, size;
    };
    static std::size_t const kPlaces = 2048; // a power of 2

    static bool ComesBefore(Entry const &, Key const &);
    static bool IsOf(Entry const &, Key const &);
    static std::size_t PlaceOf(Key const &);
    std::size_t Find(Key const &) const;

    std::vector<Entry> entries; // in the order of fonts, styles, sizes and texts
    // Indices of entries, by where a text lies in memory and how it looks. They are but hints: the entry
    // tells whether it is the right one.
    std::array<std::size_t, kPlaces> places{};
};
