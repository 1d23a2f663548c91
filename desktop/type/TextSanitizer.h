// Makes any text fit to be shaped.
#pragma once
#include <string>
#include <string_view>

namespace TextSanitizer {

// Longest text that is shown in one line, in units; it reaches far beyond the widest window.
constexpr std::size_t kMaxLineUnits = 32768;

// As UTF-8, with line breaks of every kind as spaces; cut at kMaxLineUnits.
std::string OneLine(std::u16string_view);
// As UTF-8, with line breaks of every kind as line feeds.
std::string Lines(std::u16string_view);
// Both replace lone surrogates and control characters other than tabs by U+FFFD: a zero would end the text,
// and no font has the others.

} // namespace TextSanitizer
