// Where the paragraphs of a text begin, in units and in pixels.
#pragma once
#include <cstddef>
#include <cstdint>
#include <vector>

// The paragraphs of a text, from 0; there is always one. Finding one by place or height, changing one, and
// adding or removing a few, takes a time that hardly grows with their number.
class ParagraphIndex {
public:
    struct Paragraph {
        std::uint32_t units;  // with what ends it
        std::uint32_t height; // pixels
        bool measured;        // the height is more than a guess
    };

    ParagraphIndex();

    std::size_t Count() const { return static_cast<std::size_t>(all.count); }
    Paragraph At(std::size_t index) const;
    std::size_t Units() const { return static_cast<std::size_t>(all.units); }
    long long Height() const { return static_cast<long long>(all.height); }
    // The first unit of a paragraph, and the pixels above it; the number of paragraphs stands for the end.
    std::size_t StartOf(std::size_t index) const;
    long long TopOf(std::size_t index) const;
    // The paragraph that holds the unit or the pixel; the last one for what lies beyond the end.
    std::size_t AtUnit(std::size_t unit) const;
    std::size_t AtHeight(long long pixel) const;

    void SetHeight(std::size_t index, std::uint32_t height, bool measured);
    class Replacement;
    // Other paragraphs for the place of `count` ones from the first on, with all the memory that takes: until
    // Replace, which then needs none, nothing is changed, and nothing may be.
    Replacement Prepare(std::size_t first, std::size_t count, std::vector<Paragraph> const &);
    void Replace(Replacement &&) noexcept;
    // Takes all heights as guesses; `guess` tells each from the units.
    template <class Guess> void ForgetHeights(Guess const &guess) {
        for (Block &block : blocks) {
            for (Entry &entry : block.entries)
                entry = Packed({entry.units, guess(entry.units), false});
            block.sum = SumOf(block.entries);
        }
        Rebuild();
    }

private:
    struct Entry {
        std::uint32_t units;
        std::uint32_t heightAndMark; // the top bit: measured
    };
    typedef std::vector<Entry> Entries;
    struct Sum { // of some neighbours
        std::uint64_t count = 0, units = 0, height = 0;
        Sum &operator+=(Sum const &);
        Sum &operator-=(Sum const &);
    };
    struct Block { // of neighbours, few enough to be walked through
        Entries entries;
        Sum sum;
    };
    struct Place { // of an entry: what comes before it, too
        std::size_t block, within;
        Sum before;
    };

    static Entry Packed(Paragraph const &);
    static std::uint32_t HeightOf(Entry const &);
    static Sum SumOf(Entry const &);
    static Sum SumOf(Entries const &);
    Place Find(std::uint64_t Sum::*what, std::uint64_t target) const;
    Entry &EntryAt(Place const &place) { return blocks[place.block].entries[place.within]; }
    void SetEntry(Place const &, Entry);
    void AddToTree(std::size_t block, Sum const &added, Sum const &removed);
    void TakeEntries(Replacement const &);
    void TakeBlocks(Replacement &);
    static std::vector<Block> Divided(Entries &&);
    void Rebuild();

    std::vector<Block> blocks; // none is empty
    Sum all;
    // Element n holds the sum of as many blocks before place n as the lowest bit of n says.
    std::vector<Sum> tree;
};

class ParagraphIndex::Replacement {
    friend class ParagraphIndex;

    std::size_t first = 0; // paragraph
    Entries entries;       // for as many others
    std::size_t firstBlock = 0, numBlocks = 0;
    std::vector<Block> blocks; // for those, where the number of paragraphs is another one
};
