// Where a class has its virtual operations.
#pragma once
#include <cstddef>
#include <cstring>
#include <gtest/gtest.h>
#include <vector>

// Place of a virtual operation in its table, by how the common C++ ABI writes a pointer to one: one more than
// the offset. A destructor takes two places.
template <class Function> std::size_t PlaceOf(Function function) {
    std::size_t offset = 0;
    std::memcpy(&offset, &function, sizeof offset);
    EXPECT_EQ(offset % sizeof(void *), 1u) << "not a virtual operation";
    return (offset - 1) / sizeof(void *);
}

// What stands at a place of the table that the object begins with: the function that a call leads to. By the
// same ABI the object's first word is the address of the table.
template <class Object> void const *OperationAt(std::size_t place, Object const &object) {
    void const *const *table = nullptr;
    std::memcpy(&table, static_cast<void const *>(&object), sizeof table);
    return table[place];
}

constexpr std::size_t kAfterDestructor = 2;

// The operations stand side by side from the first place on.
template <class... Functions> void ExpectInOrder(std::size_t first, Functions... functions) {
    std::vector<std::size_t> const places = {PlaceOf(functions)...};
    for (std::size_t i = 0; i < places.size(); ++i)
        EXPECT_EQ(places[i], first + i) << "operation " << i;
}
