#include "desktop/resources/ContainerIndex.h"
#include "desktop/resources/Utf.h"
#include <functional>

namespace {

// Up to here, comparing keys one after the other is faster than hashing.
constexpr std::size_t kMostUnhashed = 8;
constexpr std::size_t kFirstSlots = 4 * kMostUnhashed;

std::size_t Hash(std::u16string_view key, XMLLib::ItemKind kind) {
    return std::hash<std::u16string_view>()(key) * 31 + static_cast<std::size_t>(kind);
}

} // namespace

namespace XMLLib {

void ContainerIndex::Add(std::u16string_view key, ItemKind kind) {
    children.push_back(ChildKey{std::u16string(key), kind});
    if (children.size() <= kMostUnhashed)
        return;
    if (slots.empty() || (usedSlots + 1) * 2 > slots.size())
        Rebuild();
    else
        Enter(children.size() - 1);
}

std::size_t ContainerIndex::Find(std::u16string_view key, ItemKind kind) const {
    if (!slots.empty()) {
        std::uint32_t const entry = slots[FindSlot(key, kind)];
        return entry ? entry - 1 : kNotFound;
    }
    for (std::size_t i = 0; i < children.size(); ++i) {
        if (children[i].kind == kind && Utf::SameUnits(children[i].key, key))
            return i;
    }
    return kNotFound;
}

// The slot that holds the child, or the free slot where it would go.
std::size_t ContainerIndex::FindSlot(std::u16string_view key, ItemKind kind) const {
    std::size_t const mask = slots.size() - 1;
    std::size_t slot = Hash(key, kind) & mask;
    while (std::uint32_t const entry = slots[slot]) {
        ChildKey const &child = children[entry - 1];
        if (child.kind == kind && Utf::SameUnits(child.key, key))
            break;
        slot = (slot + 1) & mask;
    }
    return slot;
}

void ContainerIndex::Enter(std::size_t child) {
    std::uint32_t &entry = slots[FindSlot(children[child].key, children[child].kind)];
    if (entry)
        return; // an earlier child of the same key and kind stays the one that is found
    entry = static_cast<std::uint32_t>(child + 1);
    ++usedSlots;
}

void ContainerIndex::Rebuild() {
    std::size_t size = kFirstSlots;
    while (size < (usedSlots + 1) * 4)
        size *= 2;
    slots.assign(size, 0);
    usedSlots = 0;
    for (std::size_t i = 0; i < children.size(); ++i)
        Enter(i);
}

} // namespace XMLLib
