#include "tabs/TabNameWidths.h"
#include <algorithm>
#include <cstdint>

namespace {

// Texts lie this many bytes apart or more.
std::uintptr_t const kTextBytes = sizeof(UString);
// Spread the texts of a row, and each of its looks, over the places.
std::size_t const kStyleStep = 61, kSizeStep = 509;

int const kCentredVertically = 1;
int const kOneLine = 0, kUpright = 0;

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

bool TabNameWidths::ComesBefore(Entry const &entry, Key const &key) {
    unsigned int const font = entry.font.GetOrderedFontID();
    if (font != key.font)
        return font < key.font;
    if (entry.style != key.style)
        return entry.style < key.style;
    if (entry.size != key.size)
        return entry.size < key.size;
    return entry.text < key.text;
}

bool TabNameWidths::IsOf(Entry const &entry, Key const &key) {
    return entry.size == key.size && entry.style == key.style && entry.text == key.text &&
           entry.font.GetOrderedFontID() == key.font;
}

std::size_t TabNameWidths::PlaceOf(Key const &key) {
    std::size_t const text =
        static_cast<std::size_t>(reinterpret_cast<std::uintptr_t>(&key.text) / kTextBytes);
    std::size_t const style = static_cast<unsigned short>(key.style),
                      size = static_cast<unsigned short>(key.size);
    return (text + style * kStyleStep + size * kSizeStep) % kPlaces;
}

// The first entry that does not come before the key.
std::size_t TabNameWidths::Find(Key const &key) const {
    return static_cast<std::size_t>(std::lower_bound(entries.begin(), entries.end(), key, ComesBefore) -
                                    entries.begin());
}

int TabNameWidths::WidthOf(UString const &text, OS::TextLayout &layout, OS::Font::FamilyID const &font,
                           short style, short size) {
    Key const key = {text, font.GetOrderedFontID(), style, size};
    std::size_t &place = places[PlaceOf(key)];
    if (place < entries.size() && IsOf(entries[place], key))
        return entries[place].width;
    place = Find(key);
    if (place == entries.size() || !IsOf(entries[place], key)) {
        int const width = Measure(text, layout, font, style, size);
        entries.insert(entries.begin() + static_cast<std::ptrdiff_t>(place),
                       Entry{text, font, style, size, width});
    }
    return entries[place].width;
}
