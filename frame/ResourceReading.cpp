#include "frame/ResourceReading.h"

// Both ask for the child first: what the host answers for a key that is not there is its own affair.

Rect OptionalRect(boost::shared_ptr<XMLLib::ContainerItem> const &item, char const *key) {
    UString const name = ResourceKey(key);
    return item->GetContainerItem(name) ? XMLLib::GetRect(item, name) : Rect{0, 0, 0, 0};
}

Point OptionalPoint(boost::shared_ptr<XMLLib::ContainerItem> const &item, char const *key) {
    UString const name = ResourceKey(key);
    return item->GetContainerItem(name) ? XMLLib::GetPoint(item, name) : Point{0, 0};
}
