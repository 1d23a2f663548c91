// Texts that make trouble.
#pragma once
#include "fuzz/storm/Chance.h"
#include <string>

namespace RandomText {

// Mostly some plain words, in UTF-8; else something empty, long, of several lines, or of other scripts.
std::string Of(Chance &);
// For XML, as text or in an attribute.
std::string Escaped(std::string const &utf8);

} // namespace RandomText
