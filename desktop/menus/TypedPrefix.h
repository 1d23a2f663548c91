// What has been typed to find an item.
#pragma once
#include "desktop/menus/Menu.h"

// Letters typed in quick succession make a longer beginning; the same letter again and again goes through the
// items that begin with it.
class TypedPrefix {
public:
    // Takes the text; the item that it leads to from the current one, or 0 when there is none. Only items
    // that can be chosen count; letters and their capitals are the same.
    int Type(UString const &, double now, Menu const &, int current);
    bool IsGoing(double now) const { return !prefix.empty() && now < endsAt; }

private:
    int Search(UString const &wanted, Menu const &, int from) const;
    UString prefix; // in capitals
    double endsAt = 0;
};
