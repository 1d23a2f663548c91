#include "desktop/menus/MenuColumns.h"
#include "host/OSFont.h"
#include "host/TextLayout.h"
#include <algorithm>
#include <array>

namespace {

int const kFont = 0;              // in the font table
int const kWidestDecorator = 200; // pixels
std::size_t const kLongest = 4;   // how many of the items that do not show are measured

// Of the items outside of the range those with the most characters, as far as there are.
std::array<MenuItem const *, kLongest> Longest(Menu const &menu, int firstItem, int lastItem) {
    std::array<MenuItem const *, kLongest> longest{};
    std::array<std::size_t, kLongest> lengths{};
    std::size_t least = 0; // the shortest of them, which the next longer one replaces
    int number = 0;
    for (MenuItem const &item : menu.All()) {
        ++number;
        if (number >= firstItem && number <= lastItem)
            continue;
        std::size_t const length = item.text.length();
        if (length <= lengths[least])
            continue;
        longest[least] = &item;
        lengths[least] = length;
        least = static_cast<std::size_t>(std::min_element(lengths.begin(), lengths.end()) - lengths.begin());
    }
    return longest;
}

} // namespace

MenuColumns::MenuColumns(Menu const &menu) {
    for (MenuItem const &item : menu.All()) {
        icons = icons || item.icon != 0;
        submenus = submenus || item.submenu != 0;
        if (item.decorator)
            decoratorWidth =
                std::max(decoratorWidth, std::min<int>(item.decorator->GetWidth(), kWidestDecorator));
    }
}

void MenuColumns::SetFont() { SetFontData(GetIndVelaFont(kFont)); }

int MenuColumns::NaturalWidth(Menu const &menu, int firstItem, int lastItem) const {
    SetFont();
    int widest = 0;
    auto const measure = [&](MenuItem const &item) {
        widest = std::max(widest, LooseStringWidth(item.text, 0.0f, 1.0f));
    };
    for (int item = firstItem; item <= lastItem; ++item)
        measure(*menu.Find(item));
    for (MenuItem const *item : Longest(menu, firstItem, lastItem))
        if (item)
            measure(*item);
    return TextLeft() + widest + RightPad();
}
