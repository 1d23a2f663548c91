// Pictures of the gallery, made without a display.
#pragma once
#include <string>

class PageFiles;

namespace Pictures {

// Writes NAME-THEME-SCALE.png for every page, in the language ("en" or "de"), in both themes, at 1x and 2x,
// into the directory, which is made when it is not there, and prints the paths. Throws std::runtime_error,
// LoadError too, with what went wrong.
void WriteAll(PageFiles const &, std::string const &language, std::string const &directory);

} // namespace Pictures
