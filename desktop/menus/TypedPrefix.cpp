#include "desktop/menus/TypedPrefix.h"

namespace {

double const kPause = 1.0; // seconds, after which typing begins anew

UString InCapitals(UString text) {
    tarn::ToUpper(text);
    return text;
}

bool BeginsWith(UString const &text, UString const &capitals) {
    return text.length() >= capitals.length() && InCapitals(text.substr(0, capitals.length())) == capitals;
}

// Whether the text is one unit repeated.
bool IsOneLetter(UString const &text) {
    for (std::size_t i = 1; i < text.length(); ++i)
        if (text[i] != text[0])
            return false;
    return true;
}

} // namespace

int TypedPrefix::Search(UString const &wanted, Menu const &menu, int from) const {
    int const count = menu.Count();
    for (int i = 0; i < count; ++i) {
        int const item = (from - 1 + i) % count + 1;
        if (menu.CanChoose(item) && BeginsWith(menu.Find(item)->text, wanted))
            return item;
    }
    return 0;
}

int TypedPrefix::Type(UString const &text, double now, Menu const &menu, int current) {
    if (!IsGoing(now))
        prefix.clear();
    endsAt = now + kPause;
    UString const before = prefix;
    prefix += InCapitals(text);
    int const here = current < 1 ? 1 : current;
    // A longer beginning may hold for the item that the shorter one has found.
    int found = Search(prefix, menu, before.empty() && current >= 1 ? here + 1 : here);
    if (found == 0 && IsOneLetter(prefix))
        found = Search(prefix.substr(0, 1), menu, here + 1);
    return found;
}
