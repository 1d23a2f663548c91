// Where the paragraphs of a text end.
#pragma once
#include <cstddef>
#include <cstdint>
#include <string_view>
#include <vector>

namespace ParagraphBreaks {

// A paragraph without end would be laid out as a whole for each character that is typed into it: after so
// many units, line breaks included, another one begins as if the line had been full.
constexpr std::size_t kLongestParagraph = 4096;
// The same where there is no space in it: then each of its lines costs what all that follow do.
constexpr std::size_t kLongestWord = 1024;

// Whether the unit ends a line: as in CR, LF, their pair, and the separators of Unicode.
bool IsBreak(char16_t);
// The units of each paragraph, what ends it included. A text that ends with a break has an empty paragraph
// behind it if it is the end of all text.
std::vector<std::uint32_t> Split(std::u16string_view, bool atEndOfText);
// How many of the first units are taken where there is room for so many only: some fewer, so that no
// character is torn apart.
std::size_t Fitting(std::u16string_view, std::size_t room);
// How many units at the paragraph's end are its break: 0 to 2.
std::size_t BreakLength(std::u16string_view paragraph);

} // namespace ParagraphBreaks
