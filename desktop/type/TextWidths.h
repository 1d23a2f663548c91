// The widths of texts that were measured.
#pragma once
#include "desktop/type/ShapedText.h"
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

// Widths by text and shape, in logical pixels: of at most `maxTexts` texts with at most `maxUnits` units
// together, which are fewer than 2^24. A list measures thousands of texts, and a window that is made asks for
// all of its labels anew: so a width takes few bytes, and is found without going through memory that the
// others have.
//
// Two tables; new widths go to the first. When it has half of what is allowed it becomes the second one, and
// what that held is forgotten, except for what was asked for meanwhile.
class TextWidths {
public:
    TextWidths(std::size_t maxTexts, std::size_t maxUnits);

    // Nothing when it is not kept.
    std::optional<int> Find(std::u16string_view text, TextShape const &);
    // The text and shape must not be kept yet.
    void Add(std::u16string_view text, TextShape const &, int width);
    void Clear();

    std::size_t Size() const { return recent.used + former.used; }

private:
    typedef std::uint32_t Number;
    static int const kShapeBits = 8, kLengthBits = 24;
    struct Slot {
        Number hash, start; // of the text in the units
        Number length : kLengthBits;
        Number shape : kShapeBits; // index of the shape plus 1; 0: the slot is free
        int width;
    };
    // What is looked for.
    struct Key {
        std::u16string_view text;
        Number hash, shape;
    };
    // Open addressing; the number of slots is a power of two.
    struct Table {
        Slot const *Find(Key const &) const;
        void Add(Key const &, int width);

        std::vector<Slot> slots;
        std::u16string units; // of all texts
        std::size_t used = 0; // slots

    private:
        void Enter(Slot const &);
        void Grow();
    };

    Key KeyOf(std::u16string_view text, TextShape const &);
    void AddToRecent(Key const &, int width);

    std::size_t maxTextsOfOne, maxUnitsOfOne; // of one table
    std::vector<TextShape> shapes;            // few
    Table recent, former;
};
