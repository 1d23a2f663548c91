#include "tabs/TabNameWidths.h"
#include <algorithm>

namespace {

int const kCentredVertically = 1;
int const kOneLine = 0, kUpright = 0;

// What is looked for, without copies.
struct Key {
    UString const &text;
    unsigned int font;
    short style, size;
};

int Measure(UString const &text, OS::TextLayout &layout, OS::Font::FamilyID const &font, short style,
            short size) {
    UpdateTextLayout(layout, text, font, style, size, TextSettings::kAlignCenter, TextSettings::kTruncateNone,
                     kCentredVertically, kOneLine, kUpright, 0, 0.0f, 1.0f, 1.0f);
    return static_cast<int>(layout.GetWidth());
}

} // namespace

TabNameWidths &TabNameWidths::Instance() {
    static TabNameWidths widths;
    return widths;
}

int TabNameWidths::WidthOf(UString const &text, OS::TextLayout &layout, OS::Font::FamilyID const &font,
                           short style, short size) {
    Key const key = {text, font.GetOrderedFontID(), style, size};
    auto const comesBefore = [](Entry const &entry, Key const &wanted) {
        unsigned int const entryFont = entry.font.GetOrderedFontID();
        if (entryFont != wanted.font)
            return entryFont < wanted.font;
        if (entry.style != wanted.style)
            return entry.style < wanted.style;
        if (entry.size != wanted.size)
            return entry.size < wanted.size;
        return entry.text < wanted.text;
    };
    auto const place = std::lower_bound(entries.begin(), entries.end(), key, comesBefore);
    bool const known = place != entries.end() && place->style == style && place->size == size &&
                       place->font.GetOrderedFontID() == key.font && place->text == text;
    if (known)
        return place->width;
    int const width = Measure(text, layout, font, style, size);
    entries.insert(place, Entry{text, font, style, size, width});
    return width;
}
