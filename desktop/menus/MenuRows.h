// Where the items of a menu lie, one below the other.
#pragma once
#include "desktop/menus/Menu.h"
#include <vector>

// Pixels from the menu's top edge, as if all of it could be shown. Knows nothing of what the items say, so
// that long menus cost next to nothing.
class MenuRows {
public:
    static constexpr int kItemHeight = 20, kSeparatorHeight = 9;
    static constexpr int kPad = 5;         // above the first and below the last
    static constexpr int kEmptyHeight = 8; // between the pads of a menu without items

    explicit MenuRows(Menu const &);

    int Height() const { return height; }
    int Count() const { return static_cast<int>(tops.size()); }
    // Items count from 1.
    int Top(int item) const { return tops[static_cast<std::size_t>(item) - 1]; }
    int Bottom(int item) const { return item < Count() ? Top(item + 1) : height - kPad; }
    int Middle(int item) const { return (Top(item) + Bottom(item)) / 2; }
    // The item at the height; 0 above the first and below the last.
    int At(int v) const;
    // The first item whose bottom lies below the height; one more than there are when there is none.
    int FirstBelow(int v) const;

private:
    std::vector<int> tops;
    int height;
};
