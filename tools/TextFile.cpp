#include "tools/TextFile.h"
#include <cerrno>
#include <cstring>
#include <fstream>
#include <iterator>
#include <stdexcept>

std::string TextFile::Read(std::string const &path) {
    std::ifstream file(path, std::ios::binary);
    std::string const text((std::istreambuf_iterator<char>(file)), std::istreambuf_iterator<char>());
    if (!file || file.bad())
        throw std::runtime_error(path + ": the file cannot be read: " + std::strerror(errno));
    return text;
}
