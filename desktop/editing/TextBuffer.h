// The units of an edited text.
#pragma once
#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

// Keeps free room at the place that was changed last, so that the next change there moves nothing.
class TextBuffer {
public:
    std::size_t Size() const { return units.size() - (gapEnd - gapStart); }
    char16_t operator[](std::size_t at) const { return units[at < gapStart ? at : at + (gapEnd - gapStart)]; }
    // The units from start up to end, both within the text.
    std::u16string Copy(std::size_t start, std::size_t end) const;
    void AppendTo(std::u16string &, std::size_t start, std::size_t end) const;
    // Takes the memory for putting so many units in the place of so many; the next Replace that needs no more
    // takes none.
    void MakeRoom(std::size_t removed, std::size_t inserted);
    // Puts the units in the place of `removed` others. They must not be the buffer's own. When memory runs
    // out, the text stays as it is.
    void Replace(std::size_t start, std::size_t removed, std::u16string_view inserted);
    bool Equals(std::u16string_view) const;

private:
    void MoveGap(std::size_t to);
    void WidenGap(std::size_t atLeast);
    void GiveBack();

    std::vector<char16_t> units;
    std::size_t gapStart = 0, gapEnd = 0;
};
