// How wide names are, kept for the whole program.
#pragma once
#include "host/OSFont.h"
#include "host/TextLayout.h"
#include "host/UString.h"
#include <vector>

// A name that was measured once is not shaped again for its width, in whichever pane it stands. Nothing is
// ever forgotten.
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
    std::vector<Entry> entries; // in the order of fonts, styles, sizes and texts
};
