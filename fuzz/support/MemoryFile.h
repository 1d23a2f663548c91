// A file that exists in memory only.
#pragma once
#include <cstddef>
#include <cstdint>
#include <string>

// For code that takes a path. The path is valid as long as the object lives.
class MemoryFile {
public:
    MemoryFile(std::uint8_t const *data, std::size_t size);
    ~MemoryFile();
    MemoryFile(MemoryFile const &) = delete;
    MemoryFile &operator=(MemoryFile const &) = delete;

    std::string const &Path() const { return path; }

private:
    int descriptor;
    std::string path;
};
