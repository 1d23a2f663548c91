// Reads the named colours of a theme.
#pragma once
#include <string>
#include <vector>

// Sets the named colours of the theme's files, which hold <color name="..." value="#rrggbb"/> elements; a
// later file goes before an earlier one. Throws ResourceError, and changes no colour, when there is no file,
// one is broken, or a colour is not known.
void ApplyThemeFiles(std::string const &themeName, std::vector<std::string> const &paths);
