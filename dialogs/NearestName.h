// Which known name a misspelt one may have meant.
#pragma once
#include <string>
#include <vector>

namespace NearestName {

// The candidate that takes the fewest changed, added or missing characters, regardless of case; empty when
// none is near.
std::string Of(std::string const &name, std::vector<std::string> const &candidates);
// "; did you mean OvalButton?", or "; possible: A, B" when no candidate is near; nothing without candidates.
std::string Hint(std::string const &name, std::vector<std::string> const &candidates);

} // namespace NearestName
