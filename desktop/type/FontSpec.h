// One font, as plain numbers.
#pragma once

namespace FontFace {
// The bits of a face; a face of 0 is plain.
enum Bit { kBold = 1, kItalic = 2, kUnderline = 4, kCondensed = 32 };
// Those that other font files stand for.
constexpr int kFileBits = kBold | kItalic | kCondensed;
} // namespace FontFace

// A font made comparable: equal specs give equal text.
struct FontSpec {
    unsigned int family = 0; // as FamilyID::GetOrderedFontID gives it
    int face = 0;            // FontFace bits; others are ignored
    int size = 0;            // logical pixels, from kSmallestSize to kLargestSize

    static constexpr int kSmallestSize = 1;
    static constexpr int kLargestSize = 512;

    // Cuts the size to its range and the face to its bits.
    static FontSpec Make(unsigned int family, int face, int size);

    bool operator==(FontSpec const &other) const {
        return family == other.family && face == other.face && size == other.size;
    }
    bool operator!=(FontSpec const &other) const { return !(*this == other); }
};
