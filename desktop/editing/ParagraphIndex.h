// Where the paragraphs of a text begin, in units and in pixels.
#pragma once
#include <cstddef>
#include <cstdint>
#include <vector>

// The paragraphs of a text, from 0; there is always one. Finding one by place or height, and changing one,
// takes a time that hardly grows with their number.
class ParagraphIndex {
public:
    struct Paragraph {
        std::uint32_t units;  // with what ends it
        std::uint32_t height; // pixels
        bool measured;        // the height is more than a guess
    };

    ParagraphIndex();

    std::size_t Count() const { return entries.size(); }
    Paragraph At(std::size_t index) const;
    std::size_t Units() const { return unitSums.back(); }
    long long Height() const { return static_cast<long long>(heightSums.back()); }
    // The first unit of a paragraph, and the pixels above it; the number of paragraphs stands for the end.
    std::size_t StartOf(std::size_t index) const;
    long long TopOf(std::size_t index) const;
    // The paragraph that holds the unit or the pixel; the last one for what lies beyond the end.
    std::size_t AtUnit(std::size_t unit) const;
    std::size_t AtHeight(long long pixel) const;

    void SetHeight(std::size_t index, std::uint32_t height, bool measured);
    // Puts other paragraphs in the place of `count` ones from the first on.
    void Replace(std::size_t first, std::size_t count, std::vector<Paragraph> const &);
    // Takes all heights as guesses; `guess` tells each from the units.
    template <class Guess> void ForgetHeights(Guess const &guess) {
        for (Entry &entry : entries)
            entry = Packed({entry.units, guess(entry.units), false});
        Rebuild();
    }

private:
    struct Entry {
        std::uint32_t units;
        std::uint32_t heightAndMark; // the top bit: measured
    };
    static Entry Packed(Paragraph const &);
    static std::uint32_t HeightOf(Entry const &);
    void Rebuild();
    template <class Sum> void Add(std::vector<Sum> &sums, std::size_t index, std::int64_t difference);
    template <class Sum> static std::uint64_t SumBefore(std::vector<Sum> const &, std::size_t index);
    template <class Sum> std::size_t Find(std::vector<Sum> const &, std::uint64_t place) const;

    std::vector<Entry> entries;
    // Element n holds the sum of as many entries before place n as the lowest bit of n says; an element more
    // at the end holds the sum of all.
    std::vector<std::uint32_t> unitSums;
    std::vector<std::uint64_t> heightSums;
};
