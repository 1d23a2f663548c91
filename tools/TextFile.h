// A file as one string.
#pragma once
#include <string>

namespace TextFile {

// Throws std::runtime_error, naming the file, when it cannot be read.
std::string Read(std::string const &path);

} // namespace TextFile
