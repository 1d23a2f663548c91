#include "desktop/menus/MenuIds.h"
#include "host/TarnError.h"

// Never destroyed: menus of a program's own may live until its very end.
MenuIds &MenuIds::Instance() {
    static MenuIds &ids = *new MenuIds;
    return ids;
}

short MenuIds::New() {
    for (int tried = 0; tried <= kGreatest - kSmallest; ++tried) {
        latest = latest == kSmallest ? kGreatest : static_cast<short>(latest - 1);
        if (users.count(latest) == 0)
            return latest;
    }
    FailMemFullError();
    return 0;
}

void MenuIds::Remove(short id) {
    auto const found = users.find(id);
    if (found != users.end() && --found->second == 0)
        users.erase(found);
}
