// Finds a container's children by key.
#pragma once
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace XMLLib {

enum class ItemKind : std::uint8_t { kInteger, kString, kContainer, kOther };

// What the index knows of a child.
struct ChildKey {
    std::u16string key;
    ItemKind kind;
};

// From (key, kind) to the first child that has both. A few children are searched one by one; many, through a
// hash table, so that the ten-thousandth key is found as fast as the tenth. Children are only ever added.
class ContainerIndex {
public:
    static constexpr std::size_t kNotFound = static_cast<std::size_t>(-1);

    void Add(std::u16string_view key, ItemKind);
    std::size_t Find(std::u16string_view key, ItemKind) const; // place of the child, or kNotFound

private:
    std::size_t FindSlot(std::u16string_view key, ItemKind) const;
    void Enter(std::size_t child);
    void Rebuild();

    std::vector<ChildKey> children;
    std::vector<std::uint32_t>
        slots; // place of a child plus 1, or 0; open addressing, the number a power of two
    std::size_t usedSlots = 0;
};

} // namespace XMLLib
