#include "desktop/menus/MenuRows.h"
#include <algorithm>

MenuRows::MenuRows(Menu const &menu) {
    tops.reserve(menu.All().size());
    int at = kPad;
    for (MenuItem const &item : menu.All()) {
        tops.push_back(at);
        at += item.separator ? kSeparatorHeight : kItemHeight;
    }
    height = at + kPad + (tops.empty() ? kEmptyHeight : 0);
}

int MenuRows::At(int v) const {
    if (tops.empty() || v < kPad || v >= height - kPad)
        return 0;
    return static_cast<int>(std::upper_bound(tops.begin(), tops.end(), v) - tops.begin());
}

int MenuRows::FirstBelow(int v) const { return v >= height - kPad ? Count() + 1 : std::max(At(v), 1); }
