#include "desktop/menus/Menu.h"
#include <algorithm>

void Menu::Insert(int afterItem, MenuItem const &item) {
    if (items->size() >= kMostItems)
        return;
    int const after = std::clamp(afterItem, 0, static_cast<int>(Count()));
    Items &own = Own();
    own.insert(own.begin() + after, item);
}

void Menu::Delete(int item) {
    if (!Find(item))
        return;
    Items &own = Own();
    own.erase(own.begin() + (item - 1));
}
