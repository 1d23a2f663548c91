// Which part of an edited text looks how.
#pragma once
#include "desktop/type/FontSpec.h"
#include "host/TextStyle.h"
#include <cstddef>
#include <vector>

// The look of one stretch of text.
struct EditStyle {
    OS::TextStyle style;
    bool colored = false; // has a colour of its own, instead of the one of all text

    FontSpec Font() const { return FontSpec::Make(style.family.GetOrderedFontID(), style.face, style.size); }
};
bool operator==(EditStyle const &, EditStyle const &);
inline bool operator!=(EditStyle const &a, EditStyle const &b) { return !(a == b); }

namespace StyleMask {
// Which fields of a style count.
enum Bit : unsigned int { kFamily = 1, kFace = 2, kSize = 4, kColor = 8 };
} // namespace StyleMask

// Sets those fields of the style that the mask names.
void CopyStyle(unsigned int mask, OS::TextStyle const &from, EditStyle &to);

// Runs in order, without gaps, no two neighbours alike. There is always a first one, which an empty text
// takes what is typed into it from.
class StyleRuns {
public:
    struct Run {
        std::size_t start; // it goes up to the next one, or to the end
        EditStyle style;
    };
    typedef std::vector<Run> List;

    StyleRuns();

    List const &All() const { return runs; }
    std::size_t IndexAt(std::size_t unit) const; // in All
    EditStyle const &At(std::size_t unit) const { return runs[IndexAt(unit)].style; }
    // The runs between the two places, counted from the first; one even when there is nothing between.
    List Slice(std::size_t start, std::size_t end) const;
    // All runs once text is replaced: `inserted` units, which look as the list says, in the place of
    // `removed` ones. `size` is the length of the text before. Empty when they stay as they are.
    List Replaced(std::size_t start, std::size_t removed, std::size_t inserted, List const &looks,
                  std::size_t size) const;
    // All runs with another look of what lies between the two places. `size` is the length of the text. Empty
    // when they stay as they are.
    List Changed(std::size_t start, std::size_t end, unsigned int mask, OS::TextStyle const &,
                 std::size_t size) const;
    // What one of those two has told.
    void Take(List &&) noexcept;

private:
    List runs;
};
