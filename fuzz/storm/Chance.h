// Random numbers that are the same on every machine.
#pragma once
#include <cstddef>
#include <cstdint>

// The numbers that follow from a seed. They do not come from the standard library's distributions, which
// differ from one library to the next.
class Chance {
public:
    explicit Chance(std::uint64_t seed)
        : state(seed) {}
    // Of something within a run that has a seed: of a step, of a message in it.
    Chance(std::uint64_t seed, std::uint64_t within)
        : state(seed * 0x9E3779B97F4A7C15u + within * 0xD1342543DE82EF95u) {
        Next();
    }

    // 0 up to, and without, the limit, which is at least 1.
    int Below(int limit) { return static_cast<int>(Next() % static_cast<std::uint64_t>(limit)); }
    // Both ends included.
    int Between(int least, int greatest) { return least + Below(greatest - least + 1); }
    bool OneIn(int times) { return Below(times) == 0; }
    // One of the list, which is not empty.
    template <class List> auto const &Of(List const &list) {
        return list[static_cast<std::size_t>(Below(static_cast<int>(sizeof(list) / sizeof(list[0]))))];
    }
    template <class Vector> auto const &OfMany(Vector const &many) {
        return many[static_cast<std::size_t>(Below(static_cast<int>(many.size())))];
    }

private:
    std::uint64_t Next() {
        std::uint64_t z = state += 0x9E3779B97F4A7C15u;
        z = (z ^ (z >> 30)) * 0xBF58476D1CE4E5B9u;
        z = (z ^ (z >> 27)) * 0x94D049BB133111EBu;
        return z ^ (z >> 31);
    }

    std::uint64_t state;
};
